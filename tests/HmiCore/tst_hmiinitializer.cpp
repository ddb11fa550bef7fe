// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiCore/HmiInitializer>
#include <HmiCore/HmiManager>
#include <HmiCore/HmiMenuProxyModel>
#include <HmiCore/HmiModuleRootModel>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/TransitionManager>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/KeySignalTransition>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QQmlContext>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QSignalTransition>
#include <QTest>

#include <optional>

using namespace HmiCore;
using namespace HmiStateMachine;

using TransitionList = QList<QPair<StateLevel, QAbstractTransition*>>;

namespace {

/// Records the hooks and what the manager knew when they ran.
class RecordingInitializer : public HmiInitializer
{
public:
    void initializeSources() override { calls += QStringLiteral("initializeSources"); }
    void registerQmlTypes() override { calls += QStringLiteral("registerQmlTypes"); }
    void exportObjects(QQmlContext* context) override
    {
        calls += QStringLiteral("exportObjects");
        exportedTo = context;
    }
    void connectPopupStates(const QList<QPair<StateLevel, PopupState*>>&) override
    {
        calls += QStringLiteral("connectPopupStates");
    }
    void preInit(HmiManager* manager) override
    {
        calls += QStringLiteral("preInit");
        seen += manager;
    }
    void postInit(HmiManager* manager) override
    {
        calls += QStringLiteral("postInit");
        seen += manager;
        menuAtPostInit = manager->sortedModulesModel();
        rootAtPostInit = manager->modulesRootState();
    }
    void completeInitialization() override { calls += QStringLiteral("completeInitialization"); }
    void buildTopStateTree() override { calls += QStringLiteral("buildTopStateTree"); }
    HmiState* modulesRootState() override
    {
        calls += QStringLiteral("modulesRootState");
        return root;
    }
    QString rootHierarchyViewDescriptorPath() override
    {
        calls += QStringLiteral("rootHierarchyViewDescriptorPath");
        return QStringLiteral("root.json");
    }
    QString rootHierarchyViewPrefix() override
    {
        calls += QStringLiteral("rootHierarchyViewPrefix");
        return QStringLiteral("ROOT");
    }
    QSortFilterProxyModel* createMenuProxyModel(QObject* parent) override
    {
        calls += QStringLiteral("createMenuProxyModel");
        return HmiInitializer::createMenuProxyModel(parent);
    }
    void registerHandwritingFactories() override { calls += QStringLiteral("registerHandwritingFactories"); }
    void registerComplexKeyboardFactories() override { calls += QStringLiteral("registerComplexKeyboardFactories"); }

    HmiState* root = nullptr;
    QStringList calls;
    QList<HmiManager*> seen;
    QQmlContext* exportedTo = nullptr;
    QSortFilterProxyModel* menuAtPostInit = nullptr;
    HmiState* rootAtPostInit = nullptr;
};

/// Overrides only what it must.
class BareInitializer : public HmiInitializer
{
public:
    void initializeSources() override {}
    void connectPopupStates(const QList<QPair<StateLevel, PopupState*>>&) override {}
    void completeInitialization() override { ++completed; }
    void buildTopStateTree() override {}
    HmiState* modulesRootState() override { return root; }
    QString rootHierarchyViewDescriptorPath() override { return {}; }
    QString rootHierarchyViewPrefix() override { return {}; }

    HmiState* root = nullptr;
    int completed = 0;
};

} // namespace

class HmiInitializerTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    StateMachine machine;
    HmiState* views = new HmiState(QStringLiteral("Views"), &machine);
    HmiState* home = new HmiState(QStringLiteral("Home"), views);
    HmiState* radio = new HmiState(QStringLiteral("Radio"), views);
    QState* plain = new QState(views);
    PopupState* call = new PopupState(QStringLiteral("Call"), &machine);

    QStringList lines() const
    {
        QStringList found;
        const QList<LogCapture::Record> records = log->records();
        for (const LogCapture::Record& record : records)
            if (record.type == QtDebugMsg)
                found += record.category + QStringLiteral(": ") + record.message;
        return found;
    }

private Q_SLOTS:
    void initTestCase()
    {
        machine.setInitialState(views);
        views->setInitialState(home);
    }

    void init()
    {
        log.emplace(QStringLiteral("kest.hmicore.debug=true\nhmi.performance.debug=true\nhmi.trace.debug=true"));
    }
    void cleanup() { log.reset(); }

    void hooksRunInTheirOrder()
    {
        QQmlEngine engine;
        RecordingInitializer initializer;
        initializer.root = views;
        HmiManager* const manager = HmiManager::instance();
        initializer.initialize(manager, &engine);
        QCOMPARE(initializer.calls.join(QLatin1Char(' ')),
                 QStringLiteral("preInit preInit initializeSources registerQmlTypes exportObjects buildTopStateTree "
                                "createMenuProxyModel modulesRootState rootHierarchyViewDescriptorPath "
                                "rootHierarchyViewPrefix registerHandwritingFactories registerComplexKeyboardFactories "
                                "postInit"));
        QCOMPARE(initializer.seen, QList<HmiManager*>({manager, manager, manager}));
        QCOMPARE(initializer.exportedTo, engine.rootContext());
        QVERIFY(initializer.menuAtPostInit);
        QCOMPARE(initializer.rootAtPostInit, views);
        QCOMPARE(manager->viewDescriptorPath(), QStringLiteral("root.json"));
        QCOMPARE(manager->viewPrefix(), QStringLiteral("ROOT"));
        initializer.calls.clear();
        initializer.finalizeInitialization();
        QCOMPARE(initializer.calls, QStringList(QStringLiteral("completeInitialization")));
    }

    void milestonesAreLoggedLetterForLetter()
    {
        QQmlEngine engine;
        BareInitializer initializer;
        initializer.root = views;
        initializer.initialize(HmiManager::instance(), &engine);
        const QStringList expected{
            QStringLiteral("hmi.performance: initializing application"),
            QStringLiteral("hmi.trace: initializing application"),
            QStringLiteral("kest.hmicore: void HmiCore::HmiInitializer::initialize(HmiCore::HmiManager*, QQmlEngine*)"),
            QStringLiteral("hmi.performance: pre init complete"),
            QStringLiteral("hmi.trace: pre init complete"),
            QStringLiteral("kest.hmicore: AL Source objects initialized."),
            QStringLiteral("hmi.performance: AL Source objects initialized"),
            QStringLiteral("hmi.trace: AL Source objects initialized"),
            QStringLiteral("kest.hmicore: Initialized qml types registered."),
            QStringLiteral("hmi.performance: Initialized qml types registered"),
            QStringLiteral("hmi.trace: Initialized qml types registered"),
            QStringLiteral("kest.hmicore: Initialized qml objects exported."),
            QStringLiteral("hmi.performance: Initialized qml objects exported"),
            QStringLiteral("hmi.trace: Initialized qml objects exported"),
            QStringLiteral("kest.hmicore: Top state tree built."),
            QStringLiteral("hmi.performance: Top state tree built."),
            QStringLiteral("hmi.trace: Top state tree built."),
            QStringLiteral("hmi.performance: beginning postInit"),
            QStringLiteral("hmi.trace: beginning postInit"),
            QStringLiteral("hmi.performance: finished postInit"),
            QStringLiteral("hmi.trace: finished postInit"),
        };
        QCOMPARE(lines(), expected);
    }

    void theMenuSortsByPriority()
    {
        QQmlEngine engine;
        BareInitializer initializer;
        initializer.root = views;
        HmiManager* const manager = HmiManager::instance();
        initializer.initialize(manager, &engine);
        QSortFilterProxyModel* const menu = manager->sortedModulesModel();
        QVERIFY(qobject_cast<HmiMenuProxyModel*>(menu));
        QCOMPARE(menu->parent(), manager);
        QCOMPARE(menu->sourceModel(), manager->moduleModel());
        QCOMPARE(menu->sortRole(), 257);
        QVERIFY(menu->dynamicSortFilter());
        QCOMPARE(menu->sortColumn(), 0);
        QCOMPARE(menu->sortOrder(), Qt::AscendingOrder);
    }

    void theDefaultHooksDoNothing()
    {
        QQmlEngine engine;
        BareInitializer initializer;
        initializer.registerQmlTypes();
        initializer.exportObjects(engine.rootContext());
        initializer.preInit(nullptr);
        initializer.postInit(nullptr);
        initializer.registerHandwritingFactories();
        initializer.registerComplexKeyboardFactories();
        QVERIFY(log->records().isEmpty());
        QCOMPARE(initializer.completed, 0);
        initializer.finalizeInitialization();
        QCOMPARE(initializer.completed, 1);
    }

    void onlyKeySignalTransitionsArePublished()
    {
        const BareInitializer initializer;
        auto* const key = new KeySignalTransition(QStringLiteral("Open"), radio, home);
        auto* const signal = new QSignalTransition(this, &QObject::destroyed, radio);
        initializer.publishRootHierarchyTransition(key);
        initializer.publishRootHierarchyTransition(signal);
        QVERIFY(key->sourceState() != radio);
        QCOMPARE(key->targetState(), home);
        QCOMPARE(signal->sourceState(), radio);
        delete key;
        delete signal;
    }

    void nullTransitionsAreSkipped()
    {
        BareInitializer initializer;
        auto* const last = new KeySignalTransition(QStringLiteral("Open"), radio);
        initializer.connectTransitions({});
        initializer.connectTransitions({{ViewLevel, nullptr}, {SystemLevel, nullptr}, {PopupLevel, last}});
        QVERIFY(last->sourceState() != radio); // what follows is still wired
        delete last;
    }

    void transitionsElsewhereKeepTheirTarget_data()
    {
        QTest::addColumn<QAbstractState*>("target");
        QTest::newRow("no target") << static_cast<QAbstractState*>(nullptr);
        QTest::newRow("another kind of state") << static_cast<QAbstractState*>(plain);
        QTest::newRow("a named state of neither kind")
            << static_cast<QAbstractState*>(new NamedState(QStringLiteral("Named"), views));
    }

    void transitionsElsewhereKeepTheirTarget()
    {
        QFETCH(QAbstractState*, target);
        BareInitializer initializer;
        KeySignalTransition key(QStringLiteral("Open"));
        radio->addTransition(&key);
        key.setTargetState(target);
        QSignalSpy targetChanged(&key, &QAbstractTransition::targetStateChanged);
        initializer.connectTransitions({{ViewLevel, &key}});
        QCOMPARE(key.targetState(), target);
        QCOMPARE(targetChanged.count(), 0);
        QVERIFY(key.sourceState() != radio); // published all the same
        key.sourceState()->removeTransition(&key);
    }

    void triggeringRequestsTheTargetInstead_data()
    {
        QTest::addColumn<QAbstractState*>("target");
        QTest::addColumn<QString>("requested");
        QTest::newRow("popup") << static_cast<QAbstractState*>(call) << "Call";
        QTest::newRow("view") << static_cast<QAbstractState*>(radio) << "Radio";
    }

    void triggeringRequestsTheTargetInstead()
    {
        QFETCH(QAbstractState*, target);
        QFETCH(QString, requested);
        QQmlEngine engine;
        HmiGuiFramework::TransitionManager transitions(&engine, nullptr);
        HmiGuiFramework::ViewManager viewManager(&engine, &transitions, nullptr);
        HmiGuiFramework::DataStore::store(&viewManager, QStringLiteral("ViewManager"));
        // There is no such view or popup: the refusal shows that exactly this one was asked for.
        QSignalSpy refused(&viewManager, &HmiGuiFramework::ViewManager::requestRefused);

        BareInitializer initializer;
        auto* const key = new KeySignalTransition(QStringLiteral("Open"), home, target);
        initializer.connectTransitions({{ViewLevel, key}});
        QVERIFY(!key->targetState());
        QVERIFY(key->targetStates().isEmpty());

        QSignalSpy started(&machine, &QStateMachine::started);
        machine.start();
        QVERIFY(started.count() == 1 || started.wait());
        QSignalSpy triggered(key, &QAbstractTransition::triggered);
        machine.sendKeySignal(QStringLiteral("Open"));
        QVERIFY(triggered.count() == 1 || triggered.wait());
        QCOMPARE(refused.count(), 1);
        QCOMPARE(refused.first().first().toString(), requested);
        QVERIFY(home->active());
        QVERIFY(!target->active());

        QSignalSpy stopped(&machine, &QStateMachine::stopped);
        machine.stop();
        QVERIFY(stopped.count() == 1 || stopped.wait());
        delete key;
        log->take(QStringLiteral("hmi.gui"), QtWarningMsg); // the refusal
    }
};

QTEST_MAIN(HmiInitializerTest)
#include "tst_hmiinitializer.moc"
