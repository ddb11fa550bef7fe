// SPDX-License-Identifier: MIT
#include "appsmodule.h"

#include "../../moduledomains.h"
#include "../../modulekeys.h"
#include "hardkeys.h"
#include "intenttable.h"
#include "moduletranslation.h"
#include "projectionoverride.h"
#include "projectionpresence.h"

#include <HmiCore/HmiActivationOverrideManager>
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

IntentTable* makeIntents(QObject* parent)
{
    const RequestView request(QStringLiteral("APPS.Main"), QVariant(), false, QVariant());
    const auto show = [request](const IntentTable::Data&) { request(); };
    return new IntentTable(
        {{HmiIntentManager::ShowApps, show, {}, {}}, {HmiIntentManager::ShowAddedProjectionDevice, show, {}, {}}},
        parent);
}

} // namespace

AppsModule::AppsModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_presence(new ProjectionPresence(this))
    , m_override(new ProjectionOverride(m_presence, this))
    , m_intents(makeIntents(this))
{
    new HardKeys({{ModuleKey::Apps, HmiCore::HmiIntentRequest(HmiIntentManager::ShowApps, false, QVariant())}}, this);
}

QString AppsModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Apps"));
}

int AppsModule::modulePriority() const
{
    return 80;
}

int AppsModule::moduleDomain() const
{
    return ModuleDomain::Apps;
}

QString AppsModule::viewDescriptorFile() const
{
    return QStringLiteral(":/apps/views.json");
}

HmiStateMachine::Identifier AppsModule::rootStateIdentifier() const
{
    return QStringLiteral("APPS");
}

QUrl AppsModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/apps"));
}

void AppsModule::registerTypes()
{
    qmlRegisterUncreatableType<ProjectionPresence>("HmiApps", 1, 0, "ProjectionPresence",
                                                   QStringLiteral("There is one, _projectionPresence"));
}

NamedState* AppsModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("APPS.Main"), root));
    return root;
}

void AppsModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("apps"), this);
    HmiIntentManager::instance()->registerIntentHandler(m_intents);
    HmiCore::HmiActivationOverrideManager::instance()->registerOverride(m_override);
    rootContext->setContextProperty(QStringLiteral("_projectionPresence"), m_presence);
}
