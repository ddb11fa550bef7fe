// SPDX-License-Identifier: MIT
#include "statetree.h"

#include <HmiStateMachine/KeySignalTransition>

using namespace HmiStateMachine;

class KeySignalTransitionTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void worksFromItsOwnSubtree()
    {
        StateTree tree;
        new KeySignalTransition(QStringLiteral("Open"), tree.home, tree.radioMain);
        QVERIFY(tree.start());
        tree.machine.sendKeySignal(QStringLiteral("Open"));
        QVERIFY(tree.reaches(tree.radioMain));
    }

    void doesNothingElsewhereOrForOtherSignals()
    {
        StateTree tree;
        auto* const transition = new KeySignalTransition(QStringLiteral("Open"), tree.radioList, tree.home);
        QSignalSpy triggered(transition, &QAbstractTransition::triggered);
        QVERIFY(tree.start());
        tree.machine.sendKeySignal(QStringLiteral("Open"));
        tree.machine.requestState(QStringLiteral("Radio.List"));
        QVERIFY(tree.reaches(tree.radioList));
        tree.machine.sendKeySignal(QStringLiteral("open"));
        tree.machine.sendKeySignal(QString());
        tree.machine.requestState(QStringLiteral("Radio.Edit"));
        QVERIFY(tree.reaches(tree.radioEdit));
        QCOMPARE(triggered.count(), 0);
    }

    void publishedItWorksFromAnywhere()
    {
        StateTree tree;
        auto* const transition = new KeySignalTransition(QStringLiteral("Open"), tree.radioList, tree.radioEdit);
        transition->makeGloballyAvailable();
        transition->makeGloballyAvailable();
        QVERIFY(tree.start());
        QSignalSpy triggered(transition, &QAbstractTransition::triggered);
        tree.machine.sendKeySignal(QStringLiteral("Open"));
        QVERIFY(tree.reaches(tree.radioEdit));
        QCOMPARE(triggered.count(), 1);
    }

    void publishedWithoutATargetItOnlyTriggers()
    {
        StateTree tree;
        auto* const transition = new KeySignalTransition(QStringLiteral("Open"), tree.radioList);
        transition->makeGloballyAvailable();
        QVERIFY(tree.start());
        QSignalSpy homeExited(tree.home, &QState::exited);
        QSignalSpy triggered(transition, &QAbstractTransition::triggered);
        tree.machine.sendKeySignal(QStringLiteral("Open"));
        QVERIFY(triggered.wait());
        QCOMPARE(homeExited.count(), 0);
    }

    void aTargetTakenAwayAfterPublishingOnlyTriggers()
    {
        StateTree tree;
        auto* const transition = new KeySignalTransition(QStringLiteral("Call"), tree.radioList, tree.call);
        transition->makeGloballyAvailable();
        transition->setTargetState(nullptr);
        QVERIFY(tree.start());
        QSignalSpy triggered(transition, &QAbstractTransition::triggered);
        tree.machine.sendKeySignal(QStringLiteral("Call"));
        QVERIFY(triggered.wait());
        QVERIFY(tree.noPopup->active());
    }

    void aPublishedTransitionLeavesTheOtherRegionsAlone()
    {
        StateTree tree;
        auto* const transition = new KeySignalTransition(QStringLiteral("Call"), tree.radioList, tree.call);
        transition->makeGloballyAvailable();
        QVERIFY(tree.start());
        QSignalSpy homeExited(tree.home, &QState::exited);
        tree.machine.sendKeySignal(QStringLiteral("Call"));
        QVERIFY(tree.reaches(tree.call));
        QCOMPARE(homeExited.count(), 0);
    }

    void theActiveSubtreeWinsOverAPublishedOne()
    {
        StateTree tree;
        auto* const everywhere = new KeySignalTransition(QStringLiteral("Back"), tree.radioList, tree.radioEdit);
        everywhere->makeGloballyAvailable();
        new KeySignalTransition(QStringLiteral("Back"), tree.home, tree.radioMain);
        QVERIFY(tree.start());
        tree.machine.sendKeySignal(QStringLiteral("Back"));
        QVERIFY(tree.reaches(tree.radioMain));
        QVERIFY(!tree.radioEdit->active());
    }

    void aSignalForAStoppedMachineIsDropped()
    {
        StateTree tree;
        auto* const transition = new KeySignalTransition(QStringLiteral("Open"), tree.home);
        QSignalSpy triggered(transition, &QAbstractTransition::triggered);
        tree.machine.sendKeySignal(QStringLiteral("Open"));
        QVERIFY(tree.start());
        tree.machine.requestState(QStringLiteral("Radio.List"));
        QVERIFY(tree.reaches(tree.radioList));
        QCOMPARE(triggered.count(), 0);
    }
};

QTEST_GUILESS_MAIN(KeySignalTransitionTest)
#include "tst_keysignaltransition.moc"
