// SPDX-License-Identifier: MIT
#include "climatemodule.h"

#include "../../moduledomains.h"
#include "../../modulekeys.h"
#include "climate.h"
#include "climatenotice.h"
#include "hardkeys.h"
#include "intenttable.h"
#include "moduleintents.h"
#include "moduletranslation.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentRequest>
#include <HmiGuiFramework/RequestView>
#include <HmiStateMachine/HmiLayeredState>

#include <QQmlContext>
#include <QQmlEngine>
#include <QUrl>

using HmiCore::HmiIntentManager;
using HmiGuiFramework::RequestView;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

namespace {

using Data = IntentTable::Data;

QString problemOfTemperature(const Data& data)
{
    bool isNumber = false;
    const double celsius = data.value(0).toDouble(&isNumber);
    const bool isInRange = isNumber && celsius >= Climate::lowest && celsius <= Climate::highest;
    return isInRange ? QString() : Climate::tr("This temperature cannot be set");
}

void setTemperature(Climate* climate, const Data& data)
{
    climate->setTemperature(data.value(1).toInt() == Climate::Passenger ? Climate::Passenger : Climate::Driver,
                            data.value(0).toDouble());
}

IntentTable* makeIntents(Climate* climate, QObject* parent)
{
    const RequestView show(QStringLiteral("CLIMATE.Main"), QVariant(), false, QVariant());
    return new IntentTable({{HmiIntentManager::ShowClimate, [show](const Data&) { show(); }, {}, {}},
                            {ModuleIntent::SetTemperature,
                             [climate](const Data& data) { setTemperature(climate, data); },
                             {},
                             problemOfTemperature}},
                           parent);
}

} // namespace

ClimateModule::ClimateModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_climate(new Climate(this))
    , m_notice(new ClimateNotice(m_climate, this))
    , m_intents(makeIntents(m_climate, this))
{
    addKeys();
}

void ClimateModule::addKeys()
{
    new HardKeys({{ModuleKey::Climate, HmiCore::HmiIntentRequest(HmiIntentManager::ShowClimate, false, QVariant())},
                  {ModuleKey::Defrost, [this] { m_climate->setDefrosting(!m_climate->isDefrosting()); }},
                  {ModuleKey::WarmerDriver, [this] { m_climate->stepTemperature(Climate::Driver, 1); }},
                  {ModuleKey::CoolerDriver, [this] { m_climate->stepTemperature(Climate::Driver, -1); }}},
                 this);
}

QString ClimateModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Climate"));
}

int ClimateModule::modulePriority() const
{
    return 25;
}

int ClimateModule::moduleDomain() const
{
    return ModuleDomain::Climate;
}

QString ClimateModule::viewDescriptorFile() const
{
    return QStringLiteral(":/climate/views.json");
}

HmiStateMachine::Identifier ClimateModule::rootStateIdentifier() const
{
    return QStringLiteral("CLIMATE");
}

QUrl ClimateModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/climate"));
}

void ClimateModule::registerTypes()
{
    qmlRegisterUncreatableType<Climate>("HmiClimate", 1, 0, "Climate", QStringLiteral("There is one, _climate"));
}

NamedState* ClimateModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("CLIMATE.Main"), root));
    return root;
}

void ClimateModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("climate"), this);
    HmiIntentManager::instance()->registerIntentHandler(m_intents);
    rootContext->setContextProperty(QStringLiteral("_climate"), m_climate);
    rootContext->setContextProperty(QStringLiteral("_climateNotice"), m_notice);
}
