// SPDX-License-Identifier: MIT
#include "guifixture.h"

#include <HmiGuiFramework/WindowManager>

using namespace HmiGuiFramework;

class WindowManagerTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theWindowIsThereHiddenInTheSizeOfTheSettings()
    {
        AppSettings::instance()->setWindowSize(QSize(800, 480));
        const WindowManager manager(AppSettings::instance(), nullptr);
        QVERIFY(manager.hmiWindow());
        QVERIFY(!manager.hmiWindow()->isVisible());
        QCOMPARE(manager.hmiWindow()->size(), QSize(800, 480));
    }

    void theStageFillsTheWindow()
    {
        GuiFixture gui;
        WindowManager manager(AppSettings::instance(), nullptr);
        manager.attachViewmanager(nullptr);
        manager.attachViewmanager(&gui.views);
        QCOMPARE(gui.views.stage()->size(), QSizeF(manager.hmiWindow()->size()));
        manager.showScreen();
        QVERIFY(QTest::qWaitForWindowExposed(manager.hmiWindow()));
        manager.hmiWindow()->resize(640, 400);
        QTRY_COMPARE(gui.views.stage()->size(), QSizeF(640, 400));
    }

    void theStageSurvivesTheWindow()
    {
        GuiFixture gui;
        {
            WindowManager manager(AppSettings::instance(), nullptr);
            manager.attachViewmanager(&gui.views);
        }
        QCOMPARE(gui.views.stage()->parentItem(), nullptr);
    }

    void idleIsToldOnceAfterTheLastActivity()
    {
        HmiQQuickWindow window;
        QSignalSpy idle(&window, &HmiQQuickWindow::idle);
        window.setIdleTimeout(30);
        QVERIFY(idle.wait());
        QVERIFY(!idle.wait(90));
        window.userActivityNotify();
        QVERIFY(idle.wait());
    }

    void touchesCountAsActivity()
    {
        HmiQQuickWindow window;
        window.resize(100, 100);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QSignalSpy idle(&window, &HmiQQuickWindow::idle);
        window.setIdleTimeout(30);
        QVERIFY(idle.wait());
        QTest::mouseClick(&window, Qt::LeftButton, Qt::NoModifier, QPoint(10, 10));
        QVERIFY(idle.wait());
    }

    void withoutATimeOutTheWindowIsNeverIdle()
    {
        HmiQQuickWindow window;
        QSignalSpy idle(&window, &HmiQQuickWindow::idle);
        window.setIdleTimeout(20);
        window.setIdleTimeout(0);
        QVERIFY(!idle.wait(60));
    }
};

QTEST_MAIN(WindowManagerTest)
#include "tst_windowmanager.moc"
