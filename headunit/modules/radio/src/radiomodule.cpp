// SPDX-License-Identifier: MIT
#include "radiomodule.h"

#include "../../moduledomains.h"
#include "radiocontroller.h"

#include <HmiCore/HmiSubmoduleProvider>
#include <HmiStateMachine/HmiLayeredState>

#include <QQmlContext>
#include <QUrl>

using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

RadioModule::RadioModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_controller(new RadioController(this))
{
}

QString RadioModule::moduleName() const
{
    return QStringLiteral("Radio");
}

int RadioModule::modulePriority() const
{
    return 10;
}

int RadioModule::moduleDomain() const
{
    return ModuleDomain::Radio;
}

QString RadioModule::viewDescriptorFile() const
{
    return QStringLiteral(":/radio/views.json");
}

HmiStateMachine::Identifier RadioModule::rootStateIdentifier() const
{
    return QStringLiteral("RADIO");
}

QUrl RadioModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/radio"));
}

NamedState* RadioModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("RADIO.Main"), root));
    new HmiState(QStringLiteral("RADIO.Stations"), root);

    // The sound page belongs to the settings module; it is built into this state as soon as that module offers it.
    auto* const sound = new HmiLayeredState(QStringLiteral("RADIO.Sound"), root);
    HmiCore::HmiSubmoduleProvider::instance()->requestSubmodule(ModuleDomain::Sound, sound, sound->name(),
                                                                moduleDomain());
    return root;
}

void RadioModule::setupRootContext(QQmlContext* rootContext)
{
    rootContext->setContextProperty(QStringLiteral("_radio"), m_controller);
}
