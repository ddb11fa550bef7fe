// SPDX-License-Identifier: MIT
#include "phonecontroller.h"

#include "conditionalpopup.h"

#include <AL2HMIBridge/PhoneSource>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/StateMachine>

using AL2HMIBridge::PhoneSource;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;
using HmiStateMachine::StateMachine;

namespace {

const QString callView = QStringLiteral("PHONE.Call");

ViewManager* viewManager()
{
    return DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
}

bool isAssistantListening()
{
    return PhoneSource::instance()->siriActive() || PhoneSource::instance()->phoneVoiceServiceActive();
}

} // namespace

PhoneController::PhoneController(QObject* parent)
    : QObject(parent)
{
    connect(PhoneSource::instance(), &PhoneSource::incomingCallChanged, this, &PhoneController::update);
    connect(PhoneSource::instance(), &PhoneSource::callConnectedChanged, this, &PhoneController::update);
    connect(PhoneSource::instance(), &PhoneSource::diallingChanged, this, &PhoneController::update);
    auto* const assistant = new ConditionalPopup(assistantPopup(), isAssistantListening, this);
    assistant->watch(PhoneSource::instance(), &PhoneSource::siriActiveChanged,
                     &PhoneSource::phoneVoiceServiceActiveChanged);
    // A call may be there before the screens are.
    connect(StateMachine::instance(), &QStateMachine::started, this, &PhoneController::update);
}

QString PhoneController::incomingCallPopup()
{
    return QStringLiteral("PHONE.IncomingCall");
}

QString PhoneController::assistantPopup()
{
    return QStringLiteral("PHONE.Assistant");
}

QString PhoneController::assistantHintPopup()
{
    return QStringLiteral("PHONE.AssistantHint");
}

void PhoneController::update()
{
    if (!StateMachine::instance()->isRunning() || !viewManager())
        return;
    const PhoneSource* const phone = PhoneSource::instance();
    if (phone->incomingCall())
        StateMachine::instance()->sendKeySignal(incomingCallPopup());
    else
        viewManager()->closePopup(incomingCallPopup());

    const bool inCall = phone->callConnected() || phone->dialling();
    if (inCall == m_inCall)
        return;
    m_inCall = inCall;
    if (inCall)
        viewManager()->requestView(callView);
    else
        leaveCallView();
}

/// Only who still looks at the call is taken elsewhere when it ends.
void PhoneController::leaveCallView()
{
    if (viewManager()->currentView() == callView && !viewManager()->back())
        viewManager()->requestView(QStringLiteral("PHONE.Main"));
}
