// SPDX-License-Identifier: MIT
#include "statetree.h"

using namespace HmiStateMachine;

class StateMachineTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void statesAreFoundByName()
    {
        StateTree tree;
        QCOMPARE(tree.machine.findState(QStringLiteral("Radio.List")), tree.radioList);
        QCOMPARE(tree.machine.findState(QStringLiteral("radio.list")), nullptr);
        QCOMPARE(tree.machine.findState(QString()), nullptr);
    }

    void statesOfOtherMachinesAreNotFound()
    {
        const StateTree tree;
        const StateMachine other;
        QCOMPARE(other.findState(QStringLiteral("Home")), nullptr);
    }

    void ofTwoStatesWithOneNameTheFirstIsFound()
    {
        StateTree tree;
        new HmiState(QStringLiteral("Home"), tree.radio);
        QCOMPARE(tree.machine.findState(QStringLiteral("Home")), tree.home);
    }

    void deletedStatesAreNotFound()
    {
        StateTree tree;
        delete tree.radioEdit;
        QCOMPARE(tree.machine.findState(QStringLiteral("Radio.Edit")), nullptr);
    }

    void aStateMovedIntoTheTreeIsFound()
    {
        StateTree tree;
        auto* const late = new PopupState(QStringLiteral("Late"));
        QCOMPARE(tree.machine.findState(QStringLiteral("Late")), nullptr);
        late->setParent(tree.popups);
        QCOMPARE(tree.machine.findState(QStringLiteral("Late")), late);
    }

    void aRequestedStateIsEntered()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QVERIFY(tree.machine.requestState(QStringLiteral("Radio.List")));
        QVERIFY(tree.reaches(tree.radioList));
        QVERIFY(!tree.home->active());
    }

    void requestsAreRefusedWithoutARunningMachineOrAState()
    {
        StateTree tree;
        QVERIFY(!tree.machine.requestState(QStringLiteral("Home")));
        QVERIFY(tree.start());
        QVERIFY(!tree.machine.requestState(QStringLiteral("Nowhere")));
        QState stranger;
        QVERIFY(!tree.machine.requestState(&stranger));
        QVERIFY(tree.home->active());
    }

    void aRequestLeavesTheOtherRegionsAlone()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QSignalSpy homeExited(tree.home, &QState::exited);
        QVERIFY(tree.machine.requestState(QStringLiteral("Call")));
        QVERIFY(tree.reaches(tree.call));
        QVERIFY(tree.machine.requestState(QStringLiteral("Radio")));
        QVERIFY(tree.reaches(tree.radioMain));
        QVERIFY(tree.call->active());
        QCOMPARE(homeExited.count(), 1);
    }

    void commonAncestorsStayActive()
    {
        StateTree tree;
        QVERIFY(tree.start());
        tree.machine.requestState(QStringLiteral("Radio.Main"));
        QVERIFY(tree.reaches(tree.radioMain));
        QSignalSpy radioEntered(tree.radio, &QState::entered);
        tree.machine.requestState(QStringLiteral("Radio.Edit"));
        QVERIFY(tree.reaches(tree.radioEdit));
        QCOMPARE(radioEntered.count(), 0);
    }

    void anActiveStateIsNotEnteredAgain()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QSignalSpy homeEntered(tree.home, &QState::entered);
        QVERIFY(tree.machine.requestState(QStringLiteral("Home")));
        QVERIFY(tree.machine.requestState(QStringLiteral("Radio")));
        QVERIFY(tree.reaches(tree.radioMain));
        QCOMPARE(homeEntered.count(), 0);
    }

    void requestsAreServedInOrder()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QStringList entered;
        connect(&tree.machine, &StateMachine::stateEntered, this,
                [&](NamedState* state) { entered.append(state->name()); });
        tree.machine.requestState(QStringLiteral("Radio.List"));
        tree.machine.requestState(QStringLiteral("Home"));
        tree.machine.requestState(QStringLiteral("Radio.Edit"));
        QVERIFY(tree.reaches(tree.radioEdit));
        QCOMPARE(entered, QStringList({QStringLiteral("Radio"), QStringLiteral("Radio.List"), QStringLiteral("Home"),
                                       QStringLiteral("Radio"), QStringLiteral("Radio.Edit")}));
    }

    void aStateDeletedAfterTheRequestIsNotFollowed()
    {
        StateTree tree;
        QVERIFY(tree.start());
        tree.machine.requestState(QStringLiteral("Radio.Edit"));
        delete tree.radioEdit;
        tree.machine.requestState(QStringLiteral("Radio.List"));
        QVERIFY(tree.reaches(tree.radioList));
    }

    void enteringAndLeavingIsAnnounced()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QSignalSpy exited(&tree.machine, &StateMachine::stateExited);
        tree.machine.requestState(QStringLiteral("Radio.Main"));
        QVERIFY(tree.reaches(tree.radioMain));
        QCOMPARE(exited.count(), 1);
        QCOMPARE(exited.at(0).at(0).value<NamedState*>(), tree.home);
    }

    void regionIsTheInnermostStateThatIsAlwaysActive()
    {
        StateTree tree;
        QCOMPARE(StateMachine::regionOf(tree.radioList), tree.views);
        QCOMPARE(StateMachine::regionOf(tree.call), tree.popups);
        QCOMPARE(StateMachine::regionOf(tree.views), tree.root);
        QCOMPARE(StateMachine::regionOf(tree.root), static_cast<QState*>(&tree.machine));
    }

    void instanceBelongsToTheApplication()
    {
        QCOMPARE(StateMachine::instance(), StateMachine::instance());
        QCOMPARE(StateMachine::instance()->parent(), QCoreApplication::instance());
    }
};

QTEST_GUILESS_MAIN(StateMachineTest)
#include "tst_statemachine.moc"
