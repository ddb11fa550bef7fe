// SPDX-License-Identifier: MIT
#include "namedstate.h"

#include "hmilayeredstate.h"
#include "hmistate.h"
#include "popupstate.h"
#include "stateregistry.h"
#include "statemachine.h"

namespace HmiStateMachine {

NamedState::NamedState(const Identifier& name, QState* parent)
    : NamedState(name, QState::ExclusiveStates, parent)
{
}

NamedState::NamedState(const Identifier& name, QState::ChildMode mode, QState* parent)
    : QState(mode, parent)
    , m_name(name)
{
    setObjectName(name);
    stateRegistry().insert(name, this);
}

NamedState::~NamedState()
{
    stateRegistry().remove(m_name, this);
}

void NamedState::onEntry(QEvent* event)
{
    QState::onEntry(event);
    if (auto* const layered = qobject_cast<HmiLayeredState*>(parentState()))
        layered->childEntered(this);
    if (auto* const hmiMachine = qobject_cast<StateMachine*>(machine()))
        Q_EMIT hmiMachine->stateEntered(this);
}

void NamedState::onExit(QEvent* event)
{
    QState::onExit(event);
    if (auto* const hmiMachine = qobject_cast<StateMachine*>(machine()))
        Q_EMIT hmiMachine->stateExited(this);
}

HmiState::~HmiState() = default;
PopupState::~PopupState() = default;

} // namespace HmiStateMachine
