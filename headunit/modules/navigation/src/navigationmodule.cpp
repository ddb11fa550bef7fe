// SPDX-License-Identifier: MIT
#include "navigationmodule.h"

#include "../../moduledomains.h"
#include "../../modulekeys.h"
#include "hardkeys.h"
#include "intenttable.h"
#include "mapitem.h"
#include "moduletranslation.h"
#include "navigationintents.h"
#include "navigationsettings.h"
#include "navigator.h"
#include "turnannouncer.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentRequest>
#include <HmiCore/HmiSubmoduleProvider>
#include <HmiStateMachine/HmiLayeredState>

#include <QDebug>
#include <QQmlContext>
#include <QQmlEngine>
#include <QUrl>

using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

namespace {

/// A town without streets when the map is damaged: then there is nothing to drive to, and the rest works.
std::shared_ptr<const Town> loadTown()
{
    QString error;
    auto town = Town::load(QStringLiteral(":/navigation/data/town.json"), &error);
    if (town)
        return town;
    qWarning().noquote() << "navigation:" << error;
    return std::make_shared<const Town>();
}

} // namespace

NavigationModule::NavigationModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_navigator(new Navigator(loadTown(), this))
    , m_announcer(new TurnAnnouncer(m_navigator, this))
    , m_intents(makeNavigationIntents(m_navigator, this))
{
    HmiCore::HmiSubmoduleProvider::instance()->registerHostedSubmodule(ModuleDomain::Settings,
                                                                       new NavigationSettings(this));
    new HardKeys({{ModuleKey::Navigation,
                   HmiCore::HmiIntentRequest(HmiCore::HmiIntentManager::ShowNavigationMenu, false, QVariant())}},
                 this);
}

QString NavigationModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Navigation"));
}

int NavigationModule::modulePriority() const
{
    return 12;
}

int NavigationModule::moduleDomain() const
{
    return ModuleDomain::Navigation;
}

QString NavigationModule::viewDescriptorFile() const
{
    return QStringLiteral(":/navigation/views.json");
}

HmiStateMachine::Identifier NavigationModule::rootStateIdentifier() const
{
    return QStringLiteral("NAVIGATION");
}

QUrl NavigationModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/navigation"));
}

void NavigationModule::registerTypes()
{
    qmlRegisterType<MapItem>("HmiNavigation", 1, 0, "NavigationMap");
    qmlRegisterAnonymousType<Navigator>("HmiNavigation", 1);
    qmlRegisterAnonymousType<DestinationModel>("HmiNavigation", 1);
    qmlRegisterAnonymousType<StepModel>("HmiNavigation", 1);
}

NamedState* NavigationModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("NAVIGATION.Main"), root));
    new HmiState(QStringLiteral("NAVIGATION.Destinations"), root);
    new HmiState(QStringLiteral("NAVIGATION.Route"), root);
    return root;
}

void NavigationModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("navigation"), this);
    HmiCore::HmiIntentManager::instance()->registerIntentHandler(m_intents);
    rootContext->setContextProperty(QStringLiteral("_navigation"), m_navigator);
    rootContext->setContextProperty(QStringLiteral("_turnAnnouncer"), m_announcer);
    m_announcer->start();
}
