// SPDX-License-Identifier: MIT
#pragma once

#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QSignalSpy>
#include <QTest>

/// A small head unit: views (Home, and Radio with two screens) beside a region for popups.
struct StateTree
{
    HmiStateMachine::StateMachine machine;
    HmiStateMachine::NamedState* root =
        new HmiStateMachine::NamedState(QStringLiteral("Root"), QState::ParallelStates, &machine);
    HmiStateMachine::HmiState* views = new HmiStateMachine::HmiState(QStringLiteral("Views"), root);
    HmiStateMachine::HmiState* home = new HmiStateMachine::HmiState(QStringLiteral("Home"), views);
    HmiStateMachine::HmiLayeredState* radio = new HmiStateMachine::HmiLayeredState(QStringLiteral("Radio"), views);
    HmiStateMachine::HmiState* radioMain = new HmiStateMachine::HmiState(QStringLiteral("Radio.Main"), radio);
    HmiStateMachine::HmiState* radioList = new HmiStateMachine::HmiState(QStringLiteral("Radio.List"), radio);
    HmiStateMachine::HmiState* radioEdit = new HmiStateMachine::HmiState(QStringLiteral("Radio.Edit"), radio);
    QState* popups = new QState(root);
    QState* noPopup = new QState(popups);
    HmiStateMachine::PopupState* call = new HmiStateMachine::PopupState(QStringLiteral("Call"), popups);

    StateTree()
    {
        machine.setInitialState(root);
        views->setInitialState(home);
        radio->setInitialState(radioMain);
        popups->setInitialState(noPopup);
    }

    bool start()
    {
        QSignalSpy started(&machine, &QStateMachine::started);
        machine.start();
        return started.count() == 1 || started.wait();
    }

    /// Lets the machine process what was posted to it.
    bool reaches(QAbstractState* state)
    {
        return QTest::qWaitFor([state] { return state->active(); });
    }
};
