// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "recordinginitializer.h"

#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/MessageReceivePriorityQueueThread>
#include <AL2HMIBridge/MessageReceiveThread>
#include <AL2HMIBridge/TouchInputReceiverThread>
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiModuleIntegration>
#include <HmiCore/HmiModuleRootModel>
#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/HmiFrameProvider>
#include <HmiGuiFramework/HmiImageProvider>
#include <HmiGuiFramework/HmiQQuickWindow>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/TransitionManager>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiGuiFramework/ViewManager>
#include <HmiGuiFramework/WindowManager>
#include <HmiStateMachine/KeySignalTransition>

#include <QDir>
#include <QFile>
#include <QMetaMethod>
#include <QQmlContext>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QTemporaryDir>
#include <QTest>

#include <optional>

using namespace HmiCore;
using namespace HmiGuiFramework;
using HmiStateMachine::StateMachine;

namespace {

void write(const QString& fileName, const QByteArray& content)
{
    QFile file(fileName);
    if (!QDir().mkpath(QFileInfo(fileName).path()) || !file.open(QIODevice::WriteOnly)
        || file.write(content) != content.size())
        qFatal("cannot write %s", qPrintable(fileName));
}

template <typename T>
T* stored(const char* name)
{
    return DataStore::get<T>(QString::fromLatin1(name));
}

} // namespace

/// One application for all test functions, which follow its life: constructed, initialized, running.
class HmiApplicationTest : public QObject
{
    Q_OBJECT
    HmiApplication& app;
    HmiManager& manager = *HmiManager::instance();
    QTemporaryDir mainFolder;
    std::optional<RecordingInitializer> initializer;
    std::optional<LogCapture> log;

    QQmlEngine* engine() const { return app.findChild<QQmlEngine*>(); }
    QObject* exported(const char* name) const
    {
        return engine()->rootContext()->contextProperty(QString::fromLatin1(name)).value<QObject*>();
    }
    HmiQQuickWindow* window() const { return stored<WindowManager>("WindowManager")->hmiWindow(); }
    AL2HMIBridge::TouchInputReceiverThread* touchThread() const
    {
        return app.findChild<AL2HMIBridge::TouchInputReceiverThread*>();
    }
    QStringList announcements();
    bool enter(const char* state);

public:
    explicit HmiApplicationTest(HmiApplication& application)
        : app(application)
    {
    }

private Q_SLOTS:
    void initTestCase()
    {
        const QString item = QStringLiteral("import QtQuick 2.0\nItem {}\n");
        for (const char* const name : {"Main.qml", "Small.qml", "Call.qml", "Volume.qml"})
            write(mainFolder.filePath(QStringLiteral("views/") + QString::fromLatin1(name)), item.toUtf8());
        write(mainFolder.filePath(QStringLiteral("views/root.json")), R"({
            "version": 1,
            "views": [ { "name": "Start", "url": "Main.qml", "variations": { "compact": "Small.qml" } } ],
            "popups": [ { "name": "Call", "url": "Call.qml" } ],
            "transients": [ { "name": "Volume", "component": "Volume", "timeout": 1000 },
                            { "name": "Lost", "component": "Nowhere", "timeout": 1000 } ],
            "components": [ { "key": "Volume", "url": "Volume.qml" } ] })");
        write(mainFolder.filePath(QStringLiteral("views/module.json")),
              R"({ "version": 1, "views": [ { "name": "Main", "url": "Main.qml" } ] })");
        AppSettings::mainFolderPath = mainFolder.path() + QLatin1Char('/');
        AppSettings::frameworkImportPath = QStringLiteral("imports");
        QVERIFY(QDir(mainFolder.path()).mkdir(QStringLiteral("imports")));
    }

    void init() { log.emplace(QStringLiteral("kest.hmicore.debug=true")); }
    void cleanup() { log.reset(); }

    void theMetaObjectIsThatOfTheContract()
    {
        const QMetaObject& meta = HmiApplication::staticMetaObject;
        QStringList methods;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i)
            methods.append(QString::fromLatin1(meta.method(i).methodSignature()));
        QCOMPARE(methods, QStringList({QStringLiteral("hmiEntrySync()"), QStringLiteral("viewLoaded(QString,QString)"),
                                       QStringLiteral("popupLoaded(QString,QString)"),
                                       QStringLiteral("transientLoaded(QString,QString)"),
                                       QStringLiteral("passThroughViewTouched()"), QStringLiteral("themeChange()"),
                                       QStringLiteral("moduleRootStateActivated()"), QStringLiteral("showHmiUI()")}));
        for (const char* const slot : {"themeChange()", "moduleRootStateActivated()", "showHmiUI()"})
            QCOMPARE(meta.method(meta.indexOfSlot(slot)).access(), QMetaMethod::Private);
        QCOMPARE(meta.propertyCount() - meta.propertyOffset(), 0);
        QCOMPARE(meta.enumeratorCount() - meta.enumeratorOffset(), 0);
    }

    void constructionStartsTheThreads()
    {
        QVERIFY(engine());
        QCOMPARE(engine()->parent(), &app);
        QCOMPARE(manager.parent(), &app);
        const QList<QThread*> threads{app.findChild<AL2HMIBridge::MessageReceivePriorityQueueThread*>(),
                                      app.findChild<AL2HMIBridge::MessageReceiveThread*>(), touchThread()};
        for (const QThread* const thread : threads) {
            QVERIFY(thread);
            QVERIFY(thread->isRunning());
        }
    }

    void beforeInitializationNothingIsShownOrAnnounced()
    {
        app.hmiTransientRequest(QStringLiteral("ROOT.Volume"));
        QCOMPARE(announcements(), QStringList(QStringLiteral("entry")));
        QSignalSpy synced(&manager, &HmiManager::hmiThemeSync);
        Q_EMIT manager.showHmiUI();
        QCOMPARE(synced.count(), 0);
        QVERIFY(!stored<ViewManager>("ViewManager"));
    }

    void initializationBuildsTheSystem()
    {
        app.setBlacklistedDomains({8}); // Traffic
        initializer.emplace(QStringLiteral("views/root.json"), QStringLiteral("ROOT"));
        app.initialize(&*initializer);
        QCOMPARE(manager.modulesRootState(), initializer->root);
        QCOMPARE(manager.factoryDefaultHomeState(), QStringLiteral("RADIO.Main"));
        QVERIFY(log->messages(QStringLiteral("kest.hmicore"), QtDebugMsg)
                    .contains(QStringLiteral("Loaded %1 plugins").arg(4)));
    }

    void frameworkObjectsAreStoredByName_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QByteArray>("className");
        QTest::newRow("transitions") << "TransitionManager" << QByteArray("HmiGuiFramework::TransitionManager");
        QTest::newRow("views") << "ViewManager" << QByteArray("HmiGuiFramework::ViewManager");
        QTest::newRow("status bar") << "StatusBarController" << QByteArray("HmiGuiFramework::StatusBarController");
        QTest::newRow("theme") << "UiThemeManager" << QByteArray("HmiGuiFramework::UiThemeManager");
        QTest::newRow("window") << "WindowManager" << QByteArray("HmiGuiFramework::WindowManager");
    }

    void frameworkObjectsAreStoredByName()
    {
        QFETCH(QString, name);
        const QObject* const object = DataStore::get<QObject>(name);
        QVERIFY(object);
        QTEST(QByteArray(object->metaObject()->className()), "className");
        QCOMPARE(object->parent(), &app);
    }

    void frameworkObjectsAreExportedToQml()
    {
        QCOMPARE(exported("_modulesModel"), manager.sortedModulesModel());
        QCOMPARE(exported("_menuModuleCollection"), manager.moduleModel());
        QCOMPARE(exported("AppSettings"), AppSettings::instance());
        QCOMPARE(exported("_transitionManager"), stored<TransitionManager>("TransitionManager"));
        QCOMPARE(exported("_statusBarController"), stored<StatusBarController>("StatusBarController"));
        QCOMPARE(exported("_hmiWindow"), window());
        QVERIFY(
            engine()->importPathList().contains(QDir(mainFolder.path() + QStringLiteral("/imports")).canonicalPath()));
        QVERIFY(engine()->imageProvider(HmiImageProvider::imageProviderName));
        QVERIFY(engine()->imageProvider(HmiFrameProvider::imageProviderName));
        QVERIFY(!engine()->globalObject().property(QStringLiteral("traceLogger")).isUndefined());
        QVERIFY(!engine()->globalObject().property(QStringLiteral("performanceLogger")).isUndefined());
    }

    void onlyRootModulesAreInTheMenu()
    {
        QStringList names;
        for (int row = 0; row < manager.sortedModulesModel()->rowCount(); ++row)
            names += manager.sortedModulesModel()->index(row, 0).data(HmiModuleRootModel::ModuleName).toString();
        QCOMPARE(names, QStringList({QStringLiteral("Radio"), QStringLiteral("Plain")}));
        QCOMPARE(app.findChildren<HmiModuleIntegration*>(QString(), Qt::FindDirectChildrenOnly).size(), 4);
    }

    void everythingLoadedIsAnnounced()
    {
        QStringList found = announcements();
        QCOMPARE(found.takeFirst(), QStringLiteral("entry"));
        const auto url = [this](const char* file) {
            return QUrl::fromLocalFile(mainFolder.filePath(QStringLiteral("views/") + QString::fromLatin1(file)))
                .toString();
        };
        QCOMPARE(found.takeLast(), QStringLiteral("transient ROOT.Volume ") + url("Volume.qml"));
        QCOMPARE(found.takeLast(), QStringLiteral("popup ROOT.Call ") + url("Call.qml"));
        found.sort(); // the views come in no particular order
        QStringList expected{QStringLiteral("view ROOT.Start ") + url("Main.qml")};
        for (const char* const module : {"KIND", "PLAIN", "RADIO", "TRAFFIC"})
            expected += QStringLiteral("view %1.Main ").arg(QString::fromLatin1(module)) + url("Main.qml");
        expected.sort();
        QCOMPARE(found, expected);
    }

    void aChangeOfTheVariationAnnouncesAgain()
    {
        QSignalSpy entry(&app, &HmiApplication::hmiEntrySync);
        QSignalSpy views(&app, &HmiApplication::viewLoaded);
        AppSettings::instance()->setUiVariation(QStringLiteral("compact"));
        QCOMPARE(entry.count(), 1);
        QStringList urls;
        for (const QList<QVariant>& view : std::as_const(views))
            urls += view.at(1).toUrl().fileName();
        urls.sort();
        QCOMPARE(urls.last(), QStringLiteral("Small.qml"));
        AppSettings::instance()->setUiVariation(QString());
        QCOMPARE(entry.count(), 2);
    }

    void themeAndPaletteChangesClearTheImages_data()
    {
        QTest::addColumn<bool>("palette");
        QTest::newRow("theme") << false;
        QTest::newRow("palette") << true;
    }

    void themeAndPaletteChangesClearTheImages()
    {
        QFETCH(bool, palette);
        auto* const images =
            static_cast<HmiImageProvider*>(engine()->imageProvider(HmiImageProvider::imageProviderName));
        QImage icon(4, 4, QImage::Format_ARGB32);
        icon.fill(Qt::red);
        QVERIFY(QDir(mainFolder.path()).mkpath(QStringLiteral("icons")));
        QVERIFY(icon.save(mainFolder.filePath(QStringLiteral("icons/red.png"))));
        QVERIFY(!images->requestImage(QStringLiteral("red"), nullptr, QSize()).isNull());
        QVERIFY(images->cachedBytes() > 0);
        auto* const themes = stored<UiThemeManager>("UiThemeManager");
        if (palette)
            Q_EMIT themes->paletteChange(QStringLiteral("night"));
        else
            Q_EMIT themes->themeChange();
        QCOMPARE(images->cachedBytes(), 0);
    }

    void aCompletePaletteChangeIsPassedOn()
    {
        QSignalSpy changed(&manager, &HmiManager::hmiPaletteChange);
        Q_EMIT stored<UiThemeManager>("UiThemeManager")->paletteChange(QStringLiteral("night"));
        QCOMPARE(changed.count(), 0);
        Q_EMIT stored<UiThemeManager>("UiThemeManager")->paletteChangeComplete(QStringLiteral("night"));
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.first().first().toString(), QStringLiteral("night"));
    }

    void anIdleWindowTellsTheView()
    {
        auto* const views = stored<ViewManager>("ViewManager");
        QVERIFY(disconnect(window(), &HmiQQuickWindow::idle, views, &ViewManager::currentViewIdle));
        QVERIFY(connect(window(), &HmiQQuickWindow::idle, views, &ViewManager::currentViewIdle));
    }

    void touchesBehindTheHmiCountAsActivityAndArePassedOn()
    {
        QSignalSpy touched(&app, &HmiApplication::passThroughViewTouched);
        QThread* deliveredIn = nullptr;
        const auto connection = connect(
            &app, &HmiApplication::passThroughViewTouched, this, [&] { deliveredIn = QThread::currentThread(); },
            Qt::DirectConnection);
        QSignalSpy idle(window(), &HmiQQuickWindow::idle);
        window()->setIdleTimeout(1);
        QTRY_COMPARE(idle.count(), 1); // and not again without activity
        const std::unique_ptr<QThread> emitter(
            QThread::create([this] { Q_EMIT touchThread()->passThroughViewTouched(); }));
        emitter->start();
        QVERIFY(emitter->wait());
        QCOMPARE(touched.count(), 0); // on its way to this thread
        QTRY_COMPARE(touched.count(), 1);
        QCOMPARE(deliveredIn, QThread::currentThread());
        QTRY_COMPARE(idle.count(), 2);
        window()->setIdleTimeout(0);
        disconnect(connection);
    }

    void passThroughSettingsGoToTheTouchThread()
    {
        const AL2HMIBridge::BridgeTester bridge;
        app.setPassThroughViewActive(true);
        app.setPassThroughViewActive(false);
        app.setPassThroughMobileNavTouchParamsOffset(true, -3, 40);
        QCOMPARE(AL2HMIBridge::BridgeTester::takeCalls(),
                 QStringList({QStringLiteral("TouchInput.setPassThroughViewVisible(true)"),
                              QStringLiteral("TouchInput.setPassThroughViewVisible(false)"),
                              QStringLiteral("TouchInput.setMobileNavTouchParamsOffset(true, -3, 40)")}));
    }

    void requestsOfATestHarnessReachTheFramework()
    {
        QStringList refused;
        QObject context;
        connect(stored<ViewManager>("ViewManager"), &ViewManager::requestRefused, &context,
                [&](const QString& name) { refused += name; });
        app.hmiViewRequest(QStringLiteral("NO.View"));
        QCOMPARE(refused, QStringList(QStringLiteral("NO.View")));
        refused.clear();
        app.hmiPopupRequest(QStringLiteral("NO.Popup"));
        QCOMPARE(refused, QStringList(QStringLiteral("NO.Popup")));
        refused.clear();
        app.hmiPopupBatchRequest({QStringLiteral("NO.P1"), QStringLiteral("NO.P2")});
        QCOMPARE(refused, QStringList({QStringLiteral("NO.P1"), QStringLiteral("NO.P2")}));
        refused.clear();
        app.hmiViewBatchRequest({QStringLiteral("NO.V1"), QStringLiteral("NO.V2")});
        QTRY_COMPARE(refused, QStringList({QStringLiteral("NO.V1"), QStringLiteral("NO.V2")}));
        log->take(QStringLiteral("hmi.gui"), QtWarningMsg); // one for each refusal
    }

    void transientsAreShownForTheirOwnTime()
    {
        app.hmiTransientRequest(QStringLiteral("ROOT.Volume"));
        QCOMPARE(stored<StatusBarController>("StatusBarController")->transient(), QStringLiteral("ROOT.Volume"));
        stored<StatusBarController>("StatusBarController")->dismissTransient();
    }

    void startingRunsTheMachine()
    {
        QSignalSpy started(StateMachine::instance(), &QStateMachine::started);
        QSignalSpy rootActivated(&manager, &HmiManager::rootStateActivated);
        app.startHmi();
        QVERIFY(started.count() == 1 || started.wait());
        QTRY_COMPARE(rootActivated.count(), 1);
    }

    void enteredModulesAreAnnounced_data()
    {
        QTest::addColumn<QByteArray>("state");
        QTest::addColumn<QStringList>("announced");
        QTest::addColumn<int>("blacklisted");
        QTest::newRow("root module") << QByteArray("RADIO.Main") << QStringList(QStringLiteral("RADIO.Main")) << 0;
        QTest::newRow("of another kind") << QByteArray("KIND.Main") << QStringList(QStringLiteral("KIND.Main")) << 0;
        QTest::newRow("blacklisted domain") << QByteArray("TRAFFIC.Main") << QStringList() << 1;
        QTest::newRow("not an HmiState") << QByteArray("PLAIN.Main") << QStringList() << 0;
    }

    void enteredModulesAreAnnounced()
    {
        QFETCH(QByteArray, state);
        QFETCH(QStringList, announced);
        QStringList activated;
        QObject context;
        connect(&manager, &HmiManager::moduleRootStateActivated, &context,
                [&](const QString& name) { activated += name; });
        QSignalSpy blacklisted(&manager, &HmiManager::blacklistedModuleRootStateEntered);
        QVERIFY(enter(state.constData()));
        QCOMPARE(activated, announced);
        QTEST(int(blacklisted.count()), "blacklisted");
        QVERIFY(enter("Start"));
    }

    void theWindowAppearsWhenItIsAskedFor()
    {
        QVERIFY(!window()->isVisible());
        bool visibleBefore = false;
        QObject context;
        connect(&manager, &HmiManager::hmiThemeSync, &context, [&] { visibleBefore = window()->isVisible(); });
        QSignalSpy synced(&manager, &HmiManager::hmiThemeSync);
        Q_EMIT manager.showHmiUI();
        QCOMPARE(synced.count(), 1);
        QVERIFY(visibleBefore);
        QVERIFY(stored<ViewManager>("ViewManager")->stage()->window() == window());
    }
};

QStringList HmiApplicationTest::announcements()
{
    QStringList found;
    QObject context;
    const auto note = [&found](const char* kind) {
        return [&found, kind](const QString& identifier, const QString& url) {
            found += QStringLiteral("%1 %2 %3").arg(QString::fromLatin1(kind), identifier, url);
        };
    };
    connect(&app, &HmiApplication::hmiEntrySync, &context, [&] { found += QStringLiteral("entry"); });
    connect(&app, &HmiApplication::viewLoaded, &context, note("view"));
    connect(&app, &HmiApplication::popupLoaded, &context, note("popup"));
    connect(&app, &HmiApplication::transientLoaded, &context, note("transient"));
    app.syncViews();
    return found;
}

bool HmiApplicationTest::enter(const char* state)
{
    HmiStateMachine::NamedState* const wanted = StateMachine::instance()->findState(QString::fromLatin1(state));
    return wanted && (wanted->active() || StateMachine::instance()->requestState(wanted))
           && QTest::qWaitFor([wanted] { return wanted->active(); });
}

int main(int argc, char** argv)
{
    HmiApplication app(argc, argv);
    HmiApplicationTest test(app);
    return QTest::qExec(&test, argc, argv);
}

#include "tst_hmiapplication.moc"
