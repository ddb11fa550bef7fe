// SPDX-License-Identifier: MIT
#include "guifixture.h"

using namespace HmiGuiFramework;

class PopupsTest : public QObject
{
    Q_OBJECT

    static QString text(const char* name) { return QString::fromLatin1(name); }

private Q_SLOTS:
    void aPopupIsShownAndItsStateEntered()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(gui.views.requestPopup(text("M.Note"), text("hello")));
        QVERIFY(gui.becomesActive("M.Note"));
        QVERIFY(gui.isActive("M.Home"));
        QCOMPARE(gui.views.currentPopup(), text("M.Note"));
        QCOMPARE(gui.views.stage()->childItems().last()->property("popupData"), QVariant(text("hello")));
    }

    void thePriorityDecidesWhatIsOnTop()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Call"));
        gui.views.requestPopup(text("M.Note"));
        QCOMPARE(gui.views.currentPopup(), text("M.Call"));
        gui.views.closePopup(text("M.Call"));
        QCOMPARE(gui.views.currentPopup(), text("M.Note"));
        QVERIFY(gui.becomesActive("M.Note"));
    }

    void amongEqualsTheNewestIsOnTop()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Note"));
        gui.views.requestPopup(text("M.OtherNote"));
        QCOMPARE(gui.views.currentPopup(), text("M.OtherNote"));
        gui.views.requestPopup(text("M.Note"));
        QCOMPARE(gui.views.currentPopup(), text("M.Note"));
        gui.views.closePopup(text("M.Note"));
        gui.views.closePopup(text("M.OtherNote"));
        QCOMPARE(gui.views.currentPopup(), QString());
    }

    void onlyTheTopmostOnesStateIsActiveInAllRegions()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Note"));
        QVERIFY(gui.becomesActive("M.Note"));
        gui.views.requestPopup(text("M.OtherNote"));
        QVERIFY(gui.becomesActive("M.OtherNote"));
        QTRY_VERIFY(gui.noPopup->active());
        QCOMPARE(gui.views.currentPopup(), text("M.OtherNote"));
        gui.views.closePopup(text("M.OtherNote"));
        QVERIFY(gui.becomesActive("M.Note"));
        QTRY_VERIFY(!gui.isActive("M.OtherNote"));
        QCOMPARE(gui.views.currentPopup(), text("M.Note"));
        gui.views.closePopup(text("M.Note"));
        QTRY_VERIFY(gui.noPopup->active());
    }

    void theLastOneClosedLeavesNoPopupState()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Note"));
        QVERIFY(gui.becomesActive("M.Note"));
        gui.views.closePopup(text("M.Note"));
        QTRY_VERIFY(gui.noPopup->active());
        QVERIFY(!gui.isActive("M.Note"));
    }

    void aPopupBeneathIsClosedWithoutAChangeOnTop()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Note"));
        gui.views.requestPopup(text("M.Call"));
        QSignalSpy changed(&gui.views, &ViewManager::currentPopupChanged);
        gui.views.closePopup(text("M.Note"));
        gui.views.closePopup(text("Nothing"));
        QCOMPARE(changed.count(), 0);
        gui.views.closePopup(text("M.Call"));
        QCOMPARE(gui.views.currentPopup(), QString());
    }

    void aPopupWithATimeOutClosesByItself()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Short"));
        QCOMPARE(gui.views.currentPopup(), text("M.Short"));
        QTRY_COMPARE(gui.views.currentPopup(), QString());
        QTRY_VERIFY(gui.noPopup->active());
    }

    void aTimeOutCountsOnlyOnTop()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Short"));
        gui.views.requestPopup(text("M.Call"));
        QCOMPARE(gui.views.currentPopup(), text("M.Call"));
        gui.views.closePopup(text("M.Call"));
        QCOMPARE(gui.views.currentPopup(), text("M.Short"));
        QTRY_COMPARE(gui.views.currentPopup(), QString());
    }

    void aStateEnteredByTheMachineShowsItsPopup()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.machine->requestState(text("M.Note"));
        QTRY_COMPARE(gui.views.currentPopup(), text("M.Note"));
    }

    void aStateLeftByTheMachineClosesItsPopup()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Note"));
        QVERIFY(gui.becomesActive("M.Note"));
        gui.machine->requestState(gui.noPopup);
        QTRY_COMPARE(gui.views.currentPopup(), QString());
    }

    void refusedRequestsGiveOneWarningAndChangeNothing_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("reason");
        QTest::newRow("unknown") << text("Nothing") << text("there is no such popup");
        QTest::newRow("a view") << text("M.Main") << text("there is no such popup");
        QTest::newRow("without a state") << text("M.StatelessPopup")
                                         << text("the popup has no popup state of its name");
        QTest::newRow("cannot be created") << text("M.BrokenPopup") << text("qrc:/gui/data/Broken.qml:5");
    }

    void refusedRequestsGiveOneWarningAndChangeNothing()
    {
        QFETCH(QString, name);
        QFETCH(QString, reason);
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Note"));
        QSignalSpy refused(&gui.views, &ViewManager::requestRefused);
        QVERIFY(!gui.views.requestPopup(name));
        QCOMPARE(refused.count(), 1);
        QVERIFY2(refused.at(0).at(1).toString().startsWith(reason), qPrintable(refused.at(0).at(1).toString()));
        QCOMPARE(gui.log.take(text("hmi.gui"), QtWarningMsg).size(), 1);
        QCOMPARE(gui.views.currentPopup(), text("M.Note"));
        gui.views.closePopup(text("M.Note"));
        QCOMPARE(gui.views.currentPopup(), QString());
    }

    void nothingIsShownWithoutARunningMachine()
    {
        GuiFixture gui;
        QVERIFY(!gui.views.requestPopup(text("M.Note")));
        QVERIFY(gui.warned("request for \"M.Note\" refused: the state machine does not run"));
        QCOMPARE(gui.views.currentPopup(), QString());
    }
};

QTEST_MAIN(PopupsTest)
#include "tst_popups.moc"
