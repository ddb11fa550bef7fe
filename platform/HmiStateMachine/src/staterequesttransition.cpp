// SPDX-License-Identifier: MIT
#include "staterequesttransition.h"

#include <QState>

namespace HmiStateMachine {

StateRequestTransition::StateRequestTransition(QState* source, QAbstractState* target)
    : QAbstractTransition(source)
{
    setTargetState(target);
    setTransitionType(QAbstractTransition::InternalTransition);
}

bool StateRequestTransition::eventTest(QEvent* event)
{
    return event->type() == StateRequestEvent::eventType()
           && static_cast<StateRequestEvent*>(event)->target == targetState() && !targetState()->active();
}

void StateRequestTransition::onTransition(QEvent*) {}

} // namespace HmiStateMachine
