// SPDX-License-Identifier: MIT
#include "market.h"

#include <AL2HMIBridge/GlobalSource>
#include <HmiCore/HmiMarketPropertyStore>
#include <HmiCore/HmiRegionPropertyStore>
#include <HmiCore/HmiValueMapper>
#include <HmiGuiFramework/AppSettings>

#include <QLocale>
#include <QTime>

using AL2HMIBridge::GlobalSource;
using HmiCore::HmiMarketPropertyStore;
using HmiCore::HmiRegionPropertyStore;
using HmiCore::HmiValueMapper;
using HmiGuiFramework::AppSettings;

namespace {

/// Frequencies and tracks come from the vehicle in these digits; a screen has one kind.
QString withEuropeanDigits(QString text)
{
    for (QChar& character : text)
        if (character.digitValue() >= 0)
            character = QLatin1Char(char('0' + character.digitValue()));
    return text;
}

} // namespace

Market::Market(QObject* parent)
    : QObject(parent)
{
    const QString folder = AppSettings::mainFolderPath;
    const QString document = QStringLiteral("config.json");
    HmiMarketPropertyStore::instance()->loadConfiguration(folder + QLatin1String("markets"), document);
    HmiRegionPropertyStore::instance()->loadConfiguration(folder + QLatin1String("regions"), document);
    HmiValueMapper::instance()->loadValueMapping(folder + QLatin1String("valuemappings.json"));
    connect(GlobalSource::instance(), &GlobalSource::destinationCountryChanged, this, &Market::changed);
}

QVariant Market::property(const char* name)
{
    const int country = GlobalSource::instance()->destinationCountry();
    return HmiMarketPropertyStore::instance()->getProperty(country, QString::fromLatin1(name));
}

QVariant Market::regionProperty(const char* name)
{
    return HmiRegionPropertyStore::instance()->getProperty(property("region").toInt(), QString::fromLatin1(name));
}

QString Market::languageBundle() const
{
    return property("languageBundle").toString();
}

bool Market::twelveHourClock() const
{
    const QVariant value = property("twelveHourClock");
    return value.userType() == QMetaType::Bool && value.toBool(); // what is missing is a text
}

QString Market::temperatureUnit() const
{
    return property("temperatureUnit").toString();
}

QString Market::distanceUnit() const
{
    return property("distanceUnit").toString();
}

QString Market::temperature(double celsius) const
{
    const bool isFahrenheit = temperatureUnit() == QLatin1String("fahrenheit");
    const int degrees = qRound(isFahrenheit ? celsius * 9 / 5 + 32 : celsius);
    return (isFahrenheit ? tr("%1 °F") : tr("%1 °C")).arg(degrees);
}

QString Market::clock(const QString& hoursAndMinutes) const
{
    const QTime time = QTime::fromString(hoursAndMinutes, QStringLiteral("HH:mm"));
    if (!time.isValid())
        return hoursAndMinutes;
    const QString format = twelveHourClock() ? QStringLiteral("h:mm AP") : QStringLiteral("HH:mm");
    return withEuropeanDigits(QLocale().toString(time, format));
}

bool Market::offersSource(int audioSource) const
{
    const QVariant sources = regionProperty("audioSources");
    return sources.userType() != QMetaType::QVariantList || sources.toList().contains(double(audioSource));
}
