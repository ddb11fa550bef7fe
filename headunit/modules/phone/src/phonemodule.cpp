// SPDX-License-Identifier: MIT
#include "phonemodule.h"

#include "../../moduledomains.h"
#include "intenttable.h"
#include "moduletranslation.h"
#include "phonecontroller.h"
#include "phoneintents.h"
#include "phonesettings.h"

#include <AL2HMIBridge/EAPhoneSource>
#include <AL2HMIBridge/PhoneSource>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiSubmoduleProvider>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/KeySignalTransition>
#include <HmiStateMachine/PopupState>

#include <QQmlContext>
#include <QUrl>

using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::KeySignalTransition;
using HmiStateMachine::NamedState;
using HmiStateMachine::PopupState;
using HmiStateMachine::StateLevel;

PhoneModule::PhoneModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_controller(new PhoneController(this))
    , m_intents(makePhoneIntents(this))
{
    // Registered before the settings module has a place for it; it is built when that arrives.
    HmiCore::HmiSubmoduleProvider::instance()->registerHostedSubmodule(ModuleDomain::Settings, new PhoneSettings(this));
}

QString PhoneModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Phone"));
}

int PhoneModule::modulePriority() const
{
    return 20;
}

int PhoneModule::moduleDomain() const
{
    return ModuleDomain::Phone;
}

QString PhoneModule::viewDescriptorFile() const
{
    return QStringLiteral(":/phone/views.json");
}

HmiStateMachine::Identifier PhoneModule::rootStateIdentifier() const
{
    return QStringLiteral("PHONE");
}

QUrl PhoneModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/phone"));
}

NamedState* PhoneModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("PHONE.Main"), root));
    new HmiState(QStringLiteral("PHONE.Keypad"), root);
    new HmiState(QStringLiteral("PHONE.Call"), root);

    m_incomingCall = new PopupState(PhoneController::incomingCallPopup());
    m_popups = {m_incomingCall, new PopupState(PhoneController::assistantPopup()),
                new PopupState(PhoneController::assistantHintPopup())};
    m_toIncomingCall = new KeySignalTransition(PhoneController::incomingCallPopup(), modulesRootState, m_incomingCall);
    return root;
}

QList<QPair<StateLevel, QAbstractTransition*>> PhoneModule::moduleRootHierarchyTransitions() const
{
    return {{HmiStateMachine::PopupLevel, m_toIncomingCall}};
}

QList<QPair<StateLevel, PopupState*>> PhoneModule::moduleRootHierarchyPopupStates() const
{
    QList<QPair<StateLevel, PopupState*>> states;
    for (PopupState* const popup : m_popups)
        states.append({HmiStateMachine::PopupLevel, popup});
    return states;
}

void PhoneModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("phone"), this);
    HmiCore::HmiIntentManager::instance()->registerIntentHandler(m_intents);
    rootContext->setContextProperty(QStringLiteral("_phone"), m_controller);
    rootContext->setContextProperty(QStringLiteral("_phoneSource"), AL2HMIBridge::PhoneSource::instance());
    rootContext->setContextProperty(QStringLiteral("_eaPhoneSource"), AL2HMIBridge::EAPhoneSource::instance());
}
