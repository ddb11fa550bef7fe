// SPDX-License-Identifier: MIT
#include "statemachine.h"

#include "keysignalevent.h"
#include "namedstate.h"
#include "stateregistry.h"
#include "staterequesttransition.h"

#include <QCoreApplication>
#include <QPointer>
#include <QVector>

#include <utility>

namespace HmiStateMachine {

QMultiHash<QString, NamedState*>& stateRegistry()
{
    static QMultiHash<QString, NamedState*> registry;
    return registry;
}

StateMachine::StateMachine(QObject* parent)
    : QStateMachine(parent)
{
}

StateMachine::~StateMachine() = default;

StateMachine* StateMachine::instance()
{
    static QPointer<StateMachine> machine;
    if (!machine)
        machine = new StateMachine(QCoreApplication::instance());
    return machine;
}

NamedState* StateMachine::findState(const Identifier& name) const
{
    const auto found = stateRegistry().equal_range(name);
    NamedState* first = nullptr;
    for (auto it = found.first; it != found.second; ++it)
        if (it.value()->machine() == this)
            first = it.value(); // the hash lists the newest first
    return first;
}

bool StateMachine::requestState(const Identifier& name)
{
    return requestState(findState(name));
}

bool StateMachine::requestState(QAbstractState* state)
{
    if (!state || !isRunning() || state->machine() != this)
        return false;
    makeRequestable(state);
    postEvent(new StateRequestEvent(state));
    return true;
}

void StateMachine::makeRequestable(QAbstractState* target)
{
    if (m_requestable.contains(target))
        return;
    m_requestable.insert(target);
    connect(target, &QObject::destroyed, this, [this, target] { m_requestable.remove(target); });
    QState* const region = regionOf(target);
    for (QState* source = target->parentState(); source; source = source->parentState()) {
        new StateRequestTransition(source, target);
        if (source == region)
            break;
    }
}

QState* StateMachine::regionOf(QAbstractState* state)
{
    QState* region = state->machine();
    QVector<QState*> ancestors;
    for (QState* ancestor = state->parentState(); ancestor; ancestor = ancestor->parentState())
        ancestors.prepend(ancestor);
    for (QState* const ancestor : std::as_const(ancestors)) {
        if (ancestor == region)
            continue;
        const auto siblings = region->findChildren<QAbstractState*>(QString(), Qt::FindDirectChildrenOnly);
        if (region->childMode() != QState::ParallelStates && siblings.size() > 1)
            break;
        region = ancestor;
    }
    return region;
}

void StateMachine::sendKeySignal(const QString& keySignal)
{
    if (isRunning())
        postEvent(new KeySignalEvent(keySignal));
}

} // namespace HmiStateMachine
