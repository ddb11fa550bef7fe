// SPDX-License-Identifier: MIT
#include "climatenotice.h"

#include <HmiCore/HmiManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/ViewManager>

using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiGuiFramework::ViewManager;

namespace {

struct Look
{
    const char* icon;
    const char* text;
};

/// In the order of Climate::Setting.
const Look looks[] = {{"power", QT_TRANSLATE_NOOP("ClimateNotice", "Climate")},
                      {"climate", QT_TRANSLATE_NOOP("ClimateNotice", "Temperature")},
                      {"seat-heat", QT_TRANSLATE_NOOP("ClimateNotice", "Seat heating")},
                      {"fan", QT_TRANSLATE_NOOP("ClimateNotice", "Fan")},
                      {"air-face", QT_TRANSLATE_NOOP("ClimateNotice", "Air direction")},
                      {"auto", QT_TRANSLATE_NOOP("ClimateNotice", "Automatic")},
                      {"cooling", QT_TRANSLATE_NOOP("ClimateNotice", "Cooling")},
                      {"recirculation", QT_TRANSLATE_NOOP("ClimateNotice", "Recirculation")},
                      {"air-windscreen", QT_TRANSLATE_NOOP("ClimateNotice", "Windscreen")},
                      {"defrost-rear", QT_TRANSLATE_NOOP("ClimateNotice", "Rear window")},
                      {"sync", QT_TRANSLATE_NOOP("ClimateNotice", "Both sides alike")}};

} // namespace

ClimateNotice::ClimateNotice(Climate* climate, QObject* parent)
    : QObject(parent)
    , m_climate(climate)
{
    connect(climate, &Climate::altered, this, &ClimateNotice::tell);
    connect(HmiCore::HmiManager::instance(), &HmiCore::HmiManager::hmiRetranslated, this, &ClimateNotice::changed);
}

QString ClimateNotice::icon() const
{
    return QString::fromLatin1(looks[m_setting].icon);
}

QString ClimateNotice::text() const
{
    return tr(looks[m_setting].text);
}

QString ClimateNotice::value() const
{
    const bool isDriver = m_zone == Climate::Driver;
    switch (m_setting) {
    case Climate::Power:
        return onOrOff(m_climate->isOn());
    case Climate::Temperature:
        return (isDriver ? m_climate->driverTemperature() : m_climate->passengerTemperature()) + QLatin1Char(' ')
               + m_climate->unit();
    case Climate::Seat:
        return QString::number(isDriver ? m_climate->driverSeat() : m_climate->passengerSeat());
    case Climate::Fan:
        return QString::number(m_climate->fan());
    case Climate::Air:
        return QString();
    case Climate::Automatic:
        return onOrOff(m_climate->isAutomatic());
    case Climate::Cooling:
        return onOrOff(m_climate->isCooling());
    case Climate::Recirculation:
        return onOrOff(m_climate->isRecirculating());
    case Climate::Defrost:
        return onOrOff(m_climate->isDefrosting());
    case Climate::RearDefrost:
        return onOrOff(m_climate->isRearDefrosting());
    case Climate::Sync:
        return onOrOff(m_climate->isSynchronous());
    }
    return QString();
}

void ClimateNotice::tell(Climate::Setting setting, Climate::Zone zone)
{
    m_setting = setting;
    m_zone = zone;
    Q_EMIT changed();
    const auto* const views = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
    auto* const statusBar = DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"));
    if (views && statusBar && views->currentView() != QLatin1String("CLIMATE.Main"))
        statusBar->requestTransientWidget(QStringLiteral("CLIMATE.Change"), 0);
}
