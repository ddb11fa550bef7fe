// SPDX-License-Identifier: MIT
#pragma once

#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateLevel>
#include <HmiStateMachine/StateMachine>

#include <QList>
#include <QPair>

QT_BEGIN_NAMESPACE
class QAbstractTransition;
QT_END_NAMESPACE

/// The top of the head unit's state tree: the views, beside them a region for popups of modules and one of the system.
class TopStateTree
{
public:
    /// Builds the tree into \a machine, which owns it.
    explicit TopStateTree(HmiStateMachine::StateMachine* machine);

    /// The state under which modules put their root states.
    HmiStateMachine::HmiState* modulesRoot() const { return m_views; }

    /// Moves a popup's state into the region of its level.
    void addPopupState(HmiStateMachine::StateLevel level, HmiStateMachine::PopupState* state);

    /// The transitions of the tree itself: the key signal "Home" leads to the launcher.
    QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> transitions() const;

private:
    QState* addPopupRegion(QState* root);

    HmiStateMachine::HmiState* m_views;
    HmiStateMachine::HmiState* m_launcher;
    QState* m_popups;
    QState* m_systemPopups;
};
