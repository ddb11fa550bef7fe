// SPDX-License-Identifier: MIT
#include "guifixture.h"

#include <HmiGuiFramework/FrameworkTester>
#include <HmiGuiFramework/RequestPopup>
#include <HmiGuiFramework/RequestView>

using namespace HmiGuiFramework;
using HmiStateMachine::PopupState;

class RequestsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void aViewIsRequestedByFunctor()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        const RequestView request(QStringLiteral("M.List"), 42, false, QVariant());
        const RequestView copy = request;
        copy();
        QVERIFY(gui.shows("M.List"));
        QCOMPARE(gui.views.currentItem()->property("viewData"), QVariant(42));
    }

    void aPopupIsRequestedByFunctor()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        auto* const state = qobject_cast<PopupState*>(gui.machine->findState(QStringLiteral("M.Call")));
        RequestPopup(state, QStringLiteral("data"))();
        QVERIFY(gui.becomesActive("M.Call"));
        QCOMPARE(gui.views.currentPopup(), QStringLiteral("M.Call"));
    }

    void functorsWithoutWhatTheyNeedGiveOneWarning()
    {
        LogCapture log;
        RequestView(QStringLiteral("M.List"), QVariant(), false, QVariant())();
        QVERIFY(log.takeOne(QtWarningMsg, QStringLiteral("view M.List requested, but there is no view manager")));
        PopupState state(QStringLiteral("M.Call"));
        RequestPopup(&state, QVariant())();
        QVERIFY(log.takeOne(QtWarningMsg, QStringLiteral("popup M.Call requested, but there is no view manager")));
        RequestPopup(nullptr, QVariant())();
        QVERIFY(log.takeOne(QtWarningMsg, QStringLiteral("popup requested whose state is gone")));
    }

    void theTesterRequestsViewsAndPopups()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        FrameworkTester::hmiViewRequest(QStringLiteral("M.Edit"));
        QVERIFY(gui.shows("M.Edit"));
        FrameworkTester::hmiPopupRequest(QStringLiteral("M.Note"));
        QCOMPARE(gui.views.currentPopup(), QStringLiteral("M.Note"));
        FrameworkTester::hmiPopupBatchRequest({QStringLiteral("M.Call"), QStringLiteral("M.OtherNote")});
        QCOMPARE(gui.views.currentPopup(), QStringLiteral("M.Call"));
    }

    void aBatchShowsOneViewAfterTheOther()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QStringList shown;
        connect(&gui.views, &ViewManager::viewShown, this, [&](const QString& name) { shown.append(name); });
        FrameworkTester::hmiViewBatchRequest(
            {QStringLiteral("M.List"), QStringLiteral("Nowhere"), QStringLiteral("M.Main"), QStringLiteral("M.Home")});
        QTRY_COMPARE(shown,
                     QStringList({QStringLiteral("M.List"), QStringLiteral("M.Main"), QStringLiteral("M.Home")}));
        QVERIFY(gui.warned("request for \"Nowhere\" refused: there is no such view or state"));
    }

    void theTesterWithoutAViewManagerGivesOneWarningPerCall()
    {
        LogCapture log;
        FrameworkTester::hmiViewRequest(QStringLiteral("M.Edit"));
        FrameworkTester::hmiViewBatchRequest({});
        FrameworkTester::hmiPopupRequest(QStringLiteral("M.Note"));
        FrameworkTester::hmiPopupBatchRequest({});
        QCOMPARE(log.take(QStringLiteral("hmi.gui"), QtWarningMsg),
                 QStringList({QStringLiteral("hmiViewRequest: there is no view manager"),
                              QStringLiteral("hmiViewBatchRequest: there is no view manager"),
                              QStringLiteral("hmiPopupRequest: there is no view manager"),
                              QStringLiteral("hmiPopupBatchRequest: there is no view manager")}));
    }
};

QTEST_MAIN(RequestsTest)
#include "tst_requests.moc"
