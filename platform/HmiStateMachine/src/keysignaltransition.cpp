// SPDX-License-Identifier: MIT
#include "keysignaltransition.h"

#include "keysignalevent.h"
#include "statemachine.h"

namespace HmiStateMachine {

KeySignalTransition::KeySignalTransition(const Identifier& keySignal, QState* sourceState)
    : QAbstractTransition(sourceState)
    , m_keySignal(keySignal)
{
}

KeySignalTransition::KeySignalTransition(const Identifier& keySignal, QState* sourceState, QAbstractState* target)
    : KeySignalTransition(keySignal, sourceState)
{
    setTargetState(target);
}

KeySignalTransition::~KeySignalTransition() = default;

void KeySignalTransition::makeGloballyAvailable()
{
    QState* region = nullptr;
    if (targetState() && targetState()->machine())
        region = StateMachine::regionOf(targetState());
    else if (machine())
        region = machine();
    else
        region = StateMachine::instance();
    if (sourceState() == region)
        return;
    setTransitionType(QAbstractTransition::InternalTransition);
    region->addTransition(this);
}

bool KeySignalTransition::eventTest(QEvent* event)
{
    return event->type() == KeySignalEvent::eventType()
           && static_cast<KeySignalEvent*>(event)->keySignal == m_keySignal;
}

void KeySignalTransition::onTransition(QEvent*) {}

} // namespace HmiStateMachine
