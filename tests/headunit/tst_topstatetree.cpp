// SPDX-License-Identifier: MIT
#include "topstatetree.h"

#include <QSignalSpy>
#include <QTest>

using namespace HmiStateMachine;

class TopStateTreeTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void startsWithTheLauncherAndNoPopup()
    {
        StateMachine machine;
        TopStateTree tree(&machine);
        auto* const popup = new PopupState(QStringLiteral("Popup"));
        tree.addPopupState(PopupLevel, popup);
        machine.start();
        QTRY_VERIFY(machine.isRunning());
        QVERIFY(machine.findState(QStringLiteral("SYSTEM.Launcher"))->active());
        QVERIFY(!popup->active());
    }

    void popupsOfTheTwoLevelsAreIndependent()
    {
        StateMachine machine;
        TopStateTree tree(&machine);
        auto* const module = new PopupState(QStringLiteral("Module"));
        auto* const system = new PopupState(QStringLiteral("System"));
        tree.addPopupState(PopupLevel, module);
        tree.addPopupState(SystemLevel, system);
        machine.start();
        QTRY_VERIFY(machine.isRunning());
        machine.requestState(module);
        machine.requestState(system);
        QTRY_VERIFY(system->active());
        QVERIFY(module->active());
        QVERIFY(tree.modulesRoot()->active());
    }
};

QTEST_GUILESS_MAIN(TopStateTreeTest)
#include "tst_topstatetree.moc"
