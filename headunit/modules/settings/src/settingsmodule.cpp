// SPDX-License-Identifier: MIT
#include "settingsmodule.h"

#include "../../moduledomains.h"
#include "intenttable.h"
#include "moduletranslation.h"
#include "soundfactory.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentMonitor>
#include <HmiCore/HmiIntentRequest>
#include <HmiCore/HmiManager>
#include <HmiCore/HmiSubmoduleHost>
#include <HmiCore/HmiSubmoduleProvider>
#include <HmiGuiFramework/HmiAction>
#include <HmiGuiFramework/RequestView>
#include <HmiStateMachine/HmiLayeredState>

#include <QQmlContext>
#include <QUrl>

using HmiCore::HmiIntentManager;
using HmiCore::HmiIntentMonitor;
using HmiCore::HmiIntentRequest;
using HmiCore::HmiManager;
using HmiCore::HmiSubmoduleHost;
using HmiCore::HmiSubmoduleProvider;
using HmiGuiFramework::HmiAction;
using HmiGuiFramework::RequestView;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

namespace {

IntentTable* makeIntents(QObject* parent)
{
    const auto show = [](const char* view) {
        const RequestView request(QString::fromLatin1(view), QVariant(), false, QVariant());
        return [request](const IntentTable::Data&) { request(); };
    };
    return new IntentTable({{HmiIntentManager::RequestSettings, show("SETTINGS.Main"), {}, {}},
                            {HmiIntentManager::ShowSoundSettings, show("SETTINGS.Sound"), {}, {}}},
                           parent);
}

} // namespace

SettingsModule::SettingsModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_intents(makeIntents(this))
{
    // Registered early, so that a module that asks for the sound page gets it at once.
    HmiSubmoduleProvider::instance()->registerSubmoduleFactory(ModuleDomain::Sound, new SoundFactory(this));
}

QString SettingsModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Settings"));
}

int SettingsModule::modulePriority() const
{
    return 90;
}

int SettingsModule::moduleDomain() const
{
    return ModuleDomain::Settings;
}

QString SettingsModule::viewDescriptorFile() const
{
    return QStringLiteral(":/settings/views.json");
}

HmiStateMachine::Identifier SettingsModule::rootStateIdentifier() const
{
    return QStringLiteral("SETTINGS");
}

QUrl SettingsModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/settings"));
}

NamedState* SettingsModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("SETTINGS.Main"), root));
    new HmiState(QStringLiteral("SETTINGS.Display"), root);
    new HmiState(QStringLiteral("SETTINGS.Language"), root);
    new HmiState(QStringLiteral("SETTINGS.About"), root);

    auto* const sound = new HmiLayeredState(QStringLiteral("SETTINGS.Sound"), root);
    HmiSubmoduleProvider::instance()->requestSubmodule(ModuleDomain::Sound, sound, sound->name(), moduleDomain());

    m_host = new HmiSubmoduleHost(root, moduleDomain(), this);
    addPage(QStringLiteral("SETTINGS.Display"), QT_TR_NOOP("Display"), QStringLiteral("display"), 10);
    addPage(QStringLiteral("SETTINGS.Sound"), QT_TR_NOOP("Sound"), QStringLiteral("sound"), 20);
    addPage(QStringLiteral("SETTINGS.Language"), QT_TR_NOOP("Language"), QStringLiteral("language"), 60);
    addIntent(HmiIntentManager::RequestDisplayOff, QT_TR_NOOP("Darken the display"), QStringLiteral("display-off"), 40);
    addIntent(HmiIntentManager::EnterValetMode, QT_TR_NOOP("Valet mode"), QStringLiteral("key"), 50);
    addPage(QStringLiteral("SETTINGS.About"), QT_TR_NOOP("About"), QStringLiteral("info"), 90);
    HmiSubmoduleProvider::instance()->registerSubmoduleHost(moduleDomain(), m_host);
    return root;
}

/// \a text is in English; the entry shows it in the language of the HMI.
HmiAction* SettingsModule::addEntry(const char* text, const QString& icon, int order)
{
    auto* const action = new HmiAction(this);
    const auto translate = [action, text] { action->setText(tr(text)); };
    translate();
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, action, translate);
    action->setIcon(icon);
    action->setOrder(order);
    m_host->addSubmoduleEntryAction(action);
    return action;
}

void SettingsModule::addPage(const QString& view, const char* text, const QString& icon, int order)
{
    connect(addEntry(text, icon, order), &HmiAction::triggered, this, RequestView(view, QVariant(), false, QVariant()));
}

/// An entry for what the product itself can do: it is registered before the modules are.
void SettingsModule::addIntent(int intent, const char* text, const QString& icon, int order)
{
    HmiAction* const action = addEntry(text, icon, order);
    connect(action, &HmiAction::triggered, this, HmiIntentRequest(intent, false, QVariant()));
    const HmiIntentMonitor* const monitor = HmiIntentManager::instance()->intentMonitor(intent);
    action->setEnabled(monitor && monitor->enabled());
    if (monitor)
        connect(monitor, &HmiIntentMonitor::enabledChanged, action, &HmiAction::setEnabled);
}

void SettingsModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("settings"), this);
    HmiIntentManager::instance()->registerIntentHandler(m_intents);
    rootContext->setContextProperty(QStringLiteral("_settingsPages"), m_host->submoduleEntryActionModel());
    rootContext->setContextProperty(QStringLiteral("_qtVersion"), QString::fromLatin1(qVersion()));
}
