// SPDX-License-Identifier: MIT
#include "guifixture.h"

#include <QFile>
#include <QPointer>
#include <QTemporaryDir>

using namespace HmiGuiFramework;

class ViewManagerTest : public QObject
{
    Q_OBJECT

    static QString text(const char* name) { return QString::fromLatin1(name); }

private Q_SLOTS:
    void theInitialStatesViewIsShownWhenTheMachineStarts()
    {
        GuiFixture gui;
        QCOMPARE(gui.views.currentItem(), nullptr);
        QSignalSpy shown(&gui.views, &ViewManager::viewShown);
        QVERIFY(gui.start());
        QTRY_COMPARE(shown.count(), 1);
        QVERIFY(gui.views.currentItem()->isVisible());
        QCOMPARE(gui.views.currentItem()->size(), QSizeF(400, 300));
    }

    void aRequestEndsWithTheViewOnTheScreenAndItsStateEntered()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QPointer<QQuickItem> before = gui.views.currentItem();
        QVERIFY(gui.views.requestView(text("M.List"), text("data")));
        QVERIFY(gui.shows("M.List"));
        QVERIFY(gui.isActive("M.List"));
        QVERIFY(!before->isVisible());
        QCOMPARE(gui.views.currentItem()->property("viewData"), QVariant(text("data")));
    }

    void aStateThatLeadsToAViewCanBeRequested()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(gui.views.requestView(text("M.Module")));
        QVERIFY(gui.shows("M.Main"));
    }

    void aStateEnteredByTheMachineShowsItsView()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.machine->requestState(text("M.Edit"));
        QVERIFY(gui.shows("M.Edit"));
    }

    void refusedRequestsGiveOneWarningAndChangeNothing_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("transition");
        QTest::addColumn<QString>("reason");
        QTest::newRow("unknown") << text("Nowhere") << QString() << text("there is no such view or state");
        QTest::newRow("empty") << QString() << QString() << text("there is no such view or state");
        QTest::newRow("view without a state")
            << text("M.Stateless") << QString() << text("the view has no state of its name");
        QTest::newRow("state without a view") << text("M.Bare") << QString() << text("the state leads to no view");
        QTest::newRow("faulty QML") << text("M.Broken") << QString() << text("qrc:/gui/data/Broken.qml:5");
        QTest::newRow("not an item") << text("M.NotAnItem") << QString() << text("its root is not an item");
        QTest::newRow("transition") << text("M.List") << text("explode") << text("there is no transition \"explode\"");
    }

    void refusedRequestsGiveOneWarningAndChangeNothing()
    {
        QFETCH(QString, name);
        QFETCH(QString, transition);
        QFETCH(QString, reason);
        GuiFixture gui;
        QVERIFY(gui.start());
        QSignalSpy refused(&gui.views, &ViewManager::requestRefused);
        QVERIFY(!gui.views.requestView(name, QVariant(), false, transition));
        QCOMPARE(refused.count(), 1);
        QVERIFY2(refused.at(0).at(1).toString().startsWith(reason), qPrintable(refused.at(0).at(1).toString()));
        QCOMPARE(gui.log.take(text("hmi.gui"), QtWarningMsg).size(), 1);
        QVERIFY(gui.go("M.Edit"));
        QCOMPARE(gui.module->depth(), 2);
    }

    void nothingCanBeRequestedBeforeTheMachineRuns()
    {
        GuiFixture gui;
        QVERIFY(!gui.views.requestView(text("M.Home")));
        QVERIFY(gui.warned("request for \"M.Home\" refused: the state machine does not run"));
    }

    void aLongNameIsCutInTheWarning()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(!gui.views.requestView(QString(100000, QLatin1Char('x'))));
        QVERIFY(gui.log.take(text("hmi.gui"), QtWarningMsg).value(0).size() < 300);
    }

    void aViewThatCannotBeShownByTheMachineLeavesTheOldOne()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.machine->requestState(text("M.Broken"));
        QVERIFY(gui.becomesActive("M.Broken"));
        QTRY_COMPARE(gui.log.messages(text("hmi.gui"), QtWarningMsg).size(), 1);
        QVERIFY(gui.log.take(text("hmi.gui"), QtWarningMsg)
                    .at(0)
                    .startsWith(text("view M.Broken cannot be created: qrc:/gui/data/Broken.qml:5")));
        QCOMPARE(gui.views.currentView(), text("M.Home"));
        QVERIFY(gui.go("M.List"));
    }

    void dataReachesAViewThatIsShownAlready()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(gui.views.requestView(text("M.Home"), 5));
        QCOMPARE(gui.views.currentItem()->property("viewData"), QVariant(5));
    }

    void backGoesToTheLayerBeneath()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(!gui.views.back());
        QVERIFY(gui.go("M.List"));
        QVERIFY(gui.go("M.Edit"));
        QVERIFY(gui.views.back());
        QVERIFY(gui.shows("M.List"));
        QVERIFY(gui.views.back());
        QVERIFY(gui.shows("M.Main"));
        QVERIFY(!gui.views.back());
    }

    void backReversesTheSlide()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(gui.go("M.List"));
        QVERIFY(gui.go("M.Edit"));
        gui.transitions.setDuration(60000);
        QVERIFY(gui.views.back());
        QTRY_COMPARE(gui.views.currentView(), text("M.List"));
        QVERIFY(gui.views.currentItem()->x() < 0);
        gui.transitions.complete();
    }

    void aRequestDuringATransitionCompletesItFirst()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(gui.go("M.Main"));
        QStringList shown;
        connect(&gui.views, &ViewManager::viewShown, this, [&](const QString& name) { shown.append(name); });
        gui.transitions.setDuration(60000);
        gui.views.requestView(text("M.List"));
        QTRY_VERIFY(gui.transitions.isRunning());
        gui.views.requestView(text("M.Edit"));
        QTRY_COMPARE(gui.views.currentView(), text("M.Edit"));
        gui.transitions.complete();
        QCOMPARE(shown, QStringList({text("M.List"), text("M.Edit")}));
    }

    void recentViewsAreKeptAndOthersDropped()
    {
        GuiFixture gui;
        AppSettings::instance()->setViewCacheSize(1);
        QVERIFY(gui.start());
        QPointer<QQuickItem> home = gui.views.currentItem();
        QVERIFY(gui.go("M.Main"));
        QPointer<QQuickItem> main = gui.views.currentItem();
        QVERIFY(gui.go("M.List"));
        QTRY_VERIFY(!home);
        QVERIFY(main);
        QVERIFY(gui.go("M.Main"));
        QCOMPARE(gui.views.currentItem(), main.data());
    }

    void theVariationChoosesTheFile()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        QVERIFY(gui.go("M.Main"));
        QSignalSpy changed(&gui.views, &ViewManager::uiVariationChanged);
        AppSettings::instance()->setUiVariation(text("compact"));
        QCOMPARE(changed.count(), 1);
        QCOMPARE(gui.views.guiDescriptor().views.value(text("M.Main")).url,
                 QUrl(text("qrc:/gui/data/ViewCompact.qml")));
        QCOMPARE(gui.views.guiDescriptor().views.value(text("M.List")).url, QUrl(text("qrc:/gui/data/View.qml")));
        QVERIFY(gui.views.currentItem()->property("compact").toBool());
    }

    void aDescriptorLoadedLaterHasTheVariationInForce()
    {
        GuiFixture gui;
        AppSettings::instance()->setUiVariation(text("compact"));
        gui.views.loadModule(text(":/gui/data/views.json"), text("Late"), 0);
        QCOMPARE(gui.views.guiDescriptor().views.value(text("Late.Main")).url,
                 QUrl(text("qrc:/gui/data/ViewCompact.qml")));
    }

    void theVariationChangesWhileAPopupIsShown()
    {
        GuiFixture gui;
        QVERIFY(gui.start());
        gui.views.requestPopup(text("M.Call"));
        AppSettings::instance()->setUiVariation(text("compact"));
        QCOMPARE(gui.views.currentPopup(), text("M.Call"));
        QVERIFY(gui.becomesActive("M.Call"));
    }

    void theShellsAreasHoldViewsAndPopups()
    {
        GuiFixture gui;
        QTemporaryDir folder;
        QFile descriptor(folder.filePath(text("shell.json")));
        QVERIFY(descriptor.open(QIODevice::WriteOnly));
        descriptor.write(R"({"version": 1, "shell": "qrc:/gui/data/Shell.qml"})");
        descriptor.close();
        gui.views.loadModule(descriptor.fileName(), text("S"), 0);
        QVERIFY(gui.start());
        QCOMPARE(gui.views.currentItem()->parentItem()->objectName(), text("views"));
        QCOMPARE(gui.views.currentItem()->height(), 250.);
        gui.views.stage()->setSize(QSizeF(800, 450));
        QCOMPARE(gui.views.currentItem()->size(), QSizeF(800, 400));
        gui.views.requestPopup(text("M.Call"));
        const auto* const popups = gui.views.stage()->findChild<QQuickItem*>(text("popups"));
        QVERIFY(popups
                || gui.views.stage()->childItems().first()->findChild<QQuickItem*>(text("popups"))->childItems().size()
                       == 1);
    }

    void anIdleUserIsToldToTheView()
    {
        GuiFixture gui;
        gui.views.currentViewIdle();
        QVERIFY(gui.start());
        gui.views.currentViewIdle();
        QCOMPARE(gui.views.currentItem()->property("idleCount").toInt(), 1);
    }

    void theEngineMayGoBeforeTheManager()
    {
        LogCapture log;
        auto engine = std::make_unique<QQmlEngine>();
        TransitionManager transitions(engine.get(), nullptr);
        ViewManager views(engine.get(), &transitions, nullptr);
        auto* const machine = GuiFixture::Machine::instance();
        machine->setInitialState(new HmiStateMachine::HmiState(text("M.Home"), machine));
        views.loadModule(text(":/gui/data/views.json"), text("M"), 0);
        machine->start();
        QTRY_COMPARE(views.currentView(), text("M.Home"));
        engine.reset();
        QCOMPARE(views.currentItem(), nullptr);
        QVERIFY(!views.requestView(text("M.Home")));
        QVERIFY(log.takeOne(QtWarningMsg, text("request for \"M.Home\" refused: the QML engine is gone")));
        delete machine;
    }
};

QTEST_MAIN(ViewManagerTest)
#include "tst_viewmanager.moc"
