// SPDX-License-Identifier: MIT
#include "settingsmodule.h"

#include "../../moduledomains.h"
#include "soundfactory.h"

#include <HmiCore/HmiSubmoduleHost>
#include <HmiCore/HmiSubmoduleProvider>
#include <HmiGuiFramework/HmiAction>
#include <HmiGuiFramework/RequestView>
#include <HmiStateMachine/HmiLayeredState>

#include <QQmlContext>
#include <QUrl>

using HmiCore::HmiSubmoduleHost;
using HmiCore::HmiSubmoduleProvider;
using HmiGuiFramework::HmiAction;
using HmiGuiFramework::RequestView;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

SettingsModule::SettingsModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
{
    // Registered early, so that a module that asks for the sound page gets it at once.
    HmiSubmoduleProvider::instance()->registerSubmoduleFactory(ModuleDomain::Sound, new SoundFactory(this));
}

QString SettingsModule::moduleName() const
{
    return QStringLiteral("Settings");
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
    new HmiState(QStringLiteral("SETTINGS.About"), root);

    m_host = new HmiSubmoduleHost(root, moduleDomain(), this);
    addPage(QStringLiteral("SETTINGS.Display"), tr("Display"), QStringLiteral("display"), 10);
    addPage(QStringLiteral("SETTINGS.About"), tr("About"), QStringLiteral("info"), 90);
    HmiSubmoduleProvider::instance()->registerSubmoduleHost(moduleDomain(), m_host);
    return root;
}

void SettingsModule::addPage(const QString& view, const QString& text, const QString& icon, int order)
{
    auto* const action = new HmiAction(this);
    action->setText(text);
    action->setIcon(icon);
    action->setOrder(order);
    connect(action, &HmiAction::triggered, this, RequestView(view, QVariant(), false, QVariant()));
    m_host->addSubmoduleEntryAction(action);
}

void SettingsModule::setupRootContext(QQmlContext* rootContext)
{
    rootContext->setContextProperty(QStringLiteral("_settingsPages"), m_host->submoduleEntryActionModel());
    rootContext->setContextProperty(QStringLiteral("_qtVersion"), QString::fromLatin1(qVersion()));
}
