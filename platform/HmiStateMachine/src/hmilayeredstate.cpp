// SPDX-License-Identifier: MIT
#include "hmilayeredstate.h"

#include "statemachine.h"

namespace HmiStateMachine {

HmiLayeredState::HmiLayeredState(const Identifier& name, QState* parent)
    : HmiState(name, parent)
{
}

HmiLayeredState::~HmiLayeredState() = default;

NamedState* HmiLayeredState::topLayer() const
{
    return m_layers.isEmpty() ? nullptr : m_layers.last().data();
}

bool HmiLayeredState::back()
{
    m_layers.removeAll(QPointer<NamedState>()); // layers that were deleted
    auto* const hmiMachine = qobject_cast<StateMachine*>(machine());
    if (m_layers.size() < 2 || !hmiMachine)
        return false;
    return hmiMachine->requestState(m_layers.at(m_layers.size() - 2).data());
}

void HmiLayeredState::reset()
{
    if (m_layers.isEmpty())
        return;
    setInitialState(m_layers.first());
    m_layers.clear();
    Q_EMIT depthChanged();
}

void HmiLayeredState::childEntered(NamedState* child)
{
    const int depthBefore = depth();
    m_layers.removeAll(QPointer<NamedState>());
    if (m_layers.isEmpty() && initialState() != child)
        if (auto* const bottom = qobject_cast<NamedState*>(initialState()))
            m_layers.append(bottom); // a deep entry still has the start screen beneath it
    const int position = int(m_layers.indexOf(child));
    if (position < 0)
        m_layers.append(child);
    else
        m_layers.resize(position + 1);
    setInitialState(child);
    if (depth() != depthBefore)
        Q_EMIT depthChanged();
}

} // namespace HmiStateMachine
