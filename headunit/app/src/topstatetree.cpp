// SPDX-License-Identifier: MIT
#include "topstatetree.h"

#include <HmiStateMachine/KeySignalTransition>

using namespace HmiStateMachine;

namespace {

/// Popups that belong to no module.
const char* const systemPopups[] = {"SYSTEM.InputPanel", "SYSTEM.AudioSources", "SYSTEM.Standby",
                                    "SYSTEM.DisplayOff", "SYSTEM.Valet",        "SYSTEM.Voice"};

} // namespace

TopStateTree::TopStateTree(StateMachine* machine)
{
    auto* const root = new NamedState(QStringLiteral("Root"), QState::ParallelStates, machine);
    machine->setInitialState(root);
    m_views = new HmiState(QStringLiteral("Views"), root);
    m_launcher = new HmiState(QStringLiteral("SYSTEM.Launcher"), m_views);
    m_views->setInitialState(m_launcher);
    new HmiState(QStringLiteral("SYSTEM.Search"), m_views);
    new HmiState(QStringLiteral("SYSTEM.Projection"), m_views);
    m_popups = addPopupRegion(root);
    m_systemPopups = addPopupRegion(root);
    for (const char* const popup : systemPopups)
        addPopupState(SystemLevel, new PopupState(QString::fromLatin1(popup)));
}

QState* TopStateTree::addPopupRegion(QState* root)
{
    auto* const region = new QState(root);
    region->setInitialState(new QState(region)); // no popup
    return region;
}

void TopStateTree::addPopupState(StateLevel level, PopupState* state)
{
    state->setParent(level == SystemLevel ? m_systemPopups : m_popups);
}

QList<QPair<StateLevel, QAbstractTransition*>> TopStateTree::transitions() const
{
    return {{ViewLevel, new KeySignalTransition(QStringLiteral("Home"), m_views, m_launcher)}};
}
