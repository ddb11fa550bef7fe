// SPDX-License-Identifier: MIT
#include "statetree.h"

using namespace HmiStateMachine;

class HmiLayeredStateTest : public QObject
{
    Q_OBJECT

    static bool go(StateTree& tree, HmiState* state)
    {
        return tree.machine.requestState(state->name()) && tree.reaches(state);
    }

private Q_SLOTS:
    void isEmptyBeforeItIsEntered()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QCOMPARE(tree.radio->depth(), 0);
        QCOMPARE(tree.radio->topLayer(), nullptr);
        QVERIFY(!tree.radio->back());
    }

    void enteredChildrenLieOnEachOther()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QVERIFY(go(tree, tree.radioMain));
        QVERIFY(go(tree, tree.radioList));
        QVERIFY(go(tree, tree.radioEdit));
        QCOMPARE(tree.radio->depth(), 3);
        QVERIFY(tree.radio->back());
        QVERIFY(tree.reaches(tree.radioList));
        QCOMPARE(tree.radio->depth(), 2);
    }

    void enteringADeeperLayerTakesOffThoseAbove()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QVERIFY(go(tree, tree.radioMain));
        QVERIFY(go(tree, tree.radioList));
        QVERIFY(go(tree, tree.radioEdit));
        QVERIFY(go(tree, tree.radioMain));
        QCOMPARE(tree.radio->depth(), 1);
        QVERIFY(!tree.radio->back());
    }

    void theInitialStateLiesUnderADeepEntry()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QVERIFY(go(tree, tree.radioEdit));
        QCOMPARE(tree.radio->depth(), 2);
        QVERIFY(tree.radio->back());
        QVERIFY(tree.reaches(tree.radioMain));
    }

    void comingBackShowsTheLayerThatWasLeft()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QVERIFY(go(tree, tree.radioList));
        QVERIFY(go(tree, tree.home));
        QVERIFY(tree.machine.requestState(QStringLiteral("Radio")));
        QVERIFY(tree.reaches(tree.radioList));
        QCOMPARE(tree.radio->topLayer(), tree.radioList);
    }

    void resetForgetsTheLayers()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QVERIFY(go(tree, tree.radioList));
        QVERIFY(go(tree, tree.home));
        QSignalSpy depthChanged(tree.radio, &HmiLayeredState::depthChanged);
        tree.radio->reset();
        tree.radio->reset();
        QCOMPARE(depthChanged.count(), 1);
        QVERIFY(tree.machine.requestState(QStringLiteral("Radio")));
        QVERIFY(tree.reaches(tree.radioMain));
        QCOMPARE(tree.radio->depth(), 1);
    }

    void deletedLayersAreSkipped()
    {
        StateTree tree;
        QVERIFY(tree.start());
        QVERIFY(go(tree, tree.radioMain));
        QVERIFY(go(tree, tree.radioList));
        QVERIFY(go(tree, tree.radioEdit));
        delete tree.radioList;
        QVERIFY(tree.radio->back());
        QVERIFY(tree.reaches(tree.radioMain));
    }
};

QTEST_GUILESS_MAIN(HmiLayeredStateTest)
#include "tst_hmilayeredstate.moc"
