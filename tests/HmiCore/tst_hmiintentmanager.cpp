// SPDX-License-Identifier: MIT
#include "fakehandler.h"
#include "logcapture.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/hmicore.h>

#include <QMetaEnum>
#include <QMetaMethod>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>
#include <QThread>

#include <atomic>
#include <memory>
#include <optional>
#include <vector>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");

/// A new intent for each test function: what is registered stays registered.
int newIntent()
{
    static int last = HmiIntentManager::UserType;
    return ++last;
}

QString noHandler(int intent)
{
    return QStringLiteral("No handler found for intent type: %1").arg(intent);
}

QString failed(int intent)
{
    return QStringLiteral("The IntentHandler failed to perform an action.\n Intent type: %1").arg(intent);
}

} // namespace

class HmiIntentManagerTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    HmiIntentManager* manager = nullptr;
    QStringList journal;
    QStringList signalsSeen;

    /// What QML code is worth, with both modules imported.
    QVariant evaluate(const QString& expression)
    {
        QQmlEngine engine;
        QQmlComponent component(&engine);
        const QString code =
            QStringLiteral("import QtQml 2.15\nimport HmiIntents 1.0\nQtObject { property var result: %1 }");
        component.setData(code.arg(expression).toUtf8(), QUrl());
        if (!component.isReady())
            return component.errorString();
        const std::unique_ptr<QObject> object(component.create());
        return object->property("result");
    }

private Q_SLOTS:
    void initTestCase()
    {
        registerTypes();
        manager = HmiIntentManager::instance();
        connect(manager, &HmiIntentManager::aboutToBeHandled, this,
                [this](int intent) { signalsSeen.append(QStringLiteral("about %1").arg(intent)); });
        connect(manager, &HmiIntentManager::handled, this,
                [this](int intent) { signalsSeen.append(QStringLiteral("handled %1").arg(intent)); });
        connect(manager, &HmiIntentManager::handlingFailed, this, [this](int intent, const QString& error) {
            signalsSeen.append(QStringLiteral("failed %1 [%2]").arg(intent).arg(error));
        });
        connect(manager, &HmiIntentManager::noHandlerFound, this,
                [this](int intent) { signalsSeen.append(QStringLiteral("nobody %1").arg(intent)); });
    }

    void init()
    {
        log.emplace();
        journal.clear();
        signalsSeen.clear();
    }
    void cleanup() { log.reset(); }

    void theInstanceBelongsToTheApplication()
    {
        QCOMPARE(HmiIntentManager::instance(), manager);
        QCOMPARE(manager->parent(), QCoreApplication::instance());
        QQmlEngine engine;
        QCOMPARE(HmiIntentManager::intentManagerProvider(&engine, &engine), manager);
        QCOMPARE(QQmlEngine::objectOwnership(manager), QQmlEngine::CppOwnership);
    }

    void theMetaObjectIsThatOfTheContract()
    {
        const QMetaObject& meta = HmiIntentManager::staticMetaObject;
        QStringList methods;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i)
            methods.append(QString::fromLatin1(meta.method(i).methodSignature()));
        QCOMPARE(methods,
                 QStringList({QStringLiteral("aboutToBeHandled(int)"), QStringLiteral("handled(int)"),
                              QStringLiteral("handlingFailed(int,QString)"), QStringLiteral("noHandlerFound(int)"),
                              QStringLiteral("requestAction(int,QVariantList,bool,bool,QVariant)"),
                              QStringLiteral("requestAction(int,QVariantList,bool,bool)"),
                              QStringLiteral("requestAction(int,QVariantList,bool)"),
                              QStringLiteral("requestAction(int,QVariantList)"), QStringLiteral("requestAction(int)"),
                              QStringLiteral("intentMonitor(int)")}));
        QCOMPARE(meta.method(meta.methodCount() - 1).typeName(), "HmiCore::HmiIntentMonitor*");
    }

    void theIntentsAreNumberedForEver()
    {
        const auto intents = QMetaEnum::fromType<HmiIntentManager::HmiIntent>();
        QVERIFY(!intents.isFlag());
        QCOMPARE(intents.keyCount(), 74);
        for (int number = 0; number <= 72; ++number)
            QCOMPARE(intents.value(number), number);
        QCOMPARE(intents.value(73), 128);
        // Samples all over the list, written out by hand.
        const std::pair<const char*, int> samples[] = {{"GoHome", 0},
                                                       {"ShowTravelLinkMovies", 10},
                                                       {"EnterValetMode", 21},
                                                       {"Apps403PopupRequest", 24},
                                                       {"ChangeKeyboardLayout", 33},
                                                       {"NavTBTTransientShown", 36},
                                                       {"NavTBTTransientHidden", 37},
                                                       {"ShowNavPOIById", 45},
                                                       {"PhoneSiriNotEnabled", 47},
                                                       {"CancelAnnouncement", 52},
                                                       {"RequestDisplayToggle", 64},
                                                       {"ShowEUChinaDisclaimerPopup", 72},
                                                       {"UserType", 128}};
        for (const auto& sample : samples)
            QCOMPARE(intents.keyToValue(sample.first), sample.second);
    }

    void qmlKnowsTheIntents()
    {
        QCOMPARE(evaluate(QStringLiteral("HmiIntents.UserType")), QVariant(128));
        QCOMPARE(evaluate(QStringLiteral("HmiIntents.ShowEUChinaDisclaimerPopup")), QVariant(72));
        QVERIFY(evaluate(QStringLiteral("HmiIntentMonitor {}"))
                    .toString()
                    .contains(QStringLiteral("HmiIntentMonitor is not creatable")));
    }

    void aRequestThatNobodyHandlesIsReported()
    {
        const int intent = newIntent();
        QVERIFY(!manager->canPerformAction(intent));
        QVERIFY(!manager->requestAction(intent));
        QCOMPARE(log->take(core, QtWarningMsg), {noHandler(intent)});
        QCOMPARE(signalsSeen, {QStringLiteral("nobody %1").arg(intent)});
    }

    void theNewestHandlerIsAskedFirst()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent}, &journal);
        FakeHandler b(QStringLiteral("B"), {intent}, &journal);
        manager->registerIntentHandler(&a);
        manager->registerIntentHandler(&b);
        QVERIFY(manager->canPerformAction(intent));

        QVERIFY(manager->requestAction(intent));
        QCOMPARE(journal, QStringList({QStringLiteral("B"), QStringLiteral("A")}));
        QCOMPARE(signalsSeen,
                 QStringList({QStringLiteral("about %1").arg(intent), QStringLiteral("handled %1").arg(intent)}));

        journal.clear();
        QVERIFY(manager->requestAction(intent, {}, true));
        QCOMPARE(journal, {QStringLiteral("B")});
    }

    void anExclusiveRequestGoesOnUntilOneSucceeds()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent}, &journal);
        FakeHandler b(QStringLiteral("B"), {intent}, &journal);
        FakeHandler c(QStringLiteral("C"), {intent}, &journal);
        c.error = QStringLiteral("busy");
        for (FakeHandler* const handler : {&a, &b, &c})
            manager->registerIntentHandler(handler);

        QVERIFY(manager->requestAction(intent, {}, true));
        QCOMPARE(journal, QStringList({QStringLiteral("C"), QStringLiteral("B")}));
        QCOMPARE(signalsSeen.last(), QStringLiteral("handled %1").arg(intent));
    }

    void oneSuccessIsEnough()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent}, &journal);
        FakeHandler b(QStringLiteral("B"), {intent}, &journal);
        a.error = QStringLiteral("y");
        manager->registerIntentHandler(&a);
        manager->registerIntentHandler(&b);
        QVERIFY(manager->requestAction(intent));
        QCOMPARE(journal.size(), 2);
        QCOMPARE(signalsSeen.last(), QStringLiteral("handled %1").arg(intent));
    }

    void theErrorsAreToldInTheOrderTried()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent});
        FakeHandler b(QStringLiteral("B"), {intent});
        a.error = QStringLiteral("y");
        b.error = QStringLiteral("x");
        manager->registerIntentHandler(&a);
        manager->registerIntentHandler(&b);
        QVERIFY(!manager->requestAction(intent));
        QCOMPARE(signalsSeen,
                 QStringList({QStringLiteral("about %1").arg(intent), QStringLiteral("failed %1 [x\ny]").arg(intent)}));
        QCOMPARE(log->take(core, QtWarningMsg), {failed(intent)});
    }

    void anEmptyErrorBeginsNoLine()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent});
        FakeHandler b(QStringLiteral("B"), {intent});
        a.error = QStringLiteral("y");
        b.error = QStringLiteral("");
        manager->registerIntentHandler(&a);
        manager->registerIntentHandler(&b);
        QVERIFY(!manager->requestAction(intent, {}, true));
        QCOMPARE(signalsSeen.last(), QStringLiteral("failed %1 [y]").arg(intent));
        QCOMPARE(log->take(core, QtWarningMsg).size(), 1);
    }

    void goneHandlersStillCount()
    {
        const int intent = newIntent();
        {
            FakeHandler a(QStringLiteral("A"), {intent});
            manager->registerIntentHandler(&a);
        }
        QVERIFY(manager->canPerformAction(intent));
        QVERIFY(!manager->requestAction(intent));
        QCOMPARE(signalsSeen,
                 QStringList({QStringLiteral("about %1").arg(intent), QStringLiteral("failed %1 []").arg(intent)}));
        QCOMPARE(log->take(core, QtWarningMsg), {failed(intent)});
    }

    void whoIsRegisteredTwiceIsAskedTwice()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent}, &journal);
        manager->registerIntentHandler(&a);
        manager->registerIntentHandler(&a);
        QVERIFY(manager->requestAction(intent));
        QCOMPARE(journal.size(), 2);
    }

    void anIntentThatWasAddedTwiceIsRegisteredTwice()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent, intent}, &journal);
        QCOMPARE(a.handledActions(), QList<int>({intent, intent}));
        manager->registerIntentHandler(&a);
        QVERIFY(manager->requestAction(intent));
        QCOMPARE(journal.size(), 2);
    }

    void aHandlerIsOfferedItsOwnIntentsOnly()
    {
        const int first = newIntent();
        const int second = newIntent();
        FakeHandler a(QStringLiteral("A"), {first}, &journal);
        FakeHandler b(QStringLiteral("B"), {first, second}, &journal);
        manager->registerIntentHandler(&a);
        manager->registerIntentHandler(&b);
        QVERIFY(manager->requestAction(second));
        QCOMPARE(journal, {QStringLiteral("B")});
        QCOMPARE(b.requests.constLast().intent, second);
    }

    void theHandlerGetsWhatWasSent()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent});
        manager->registerIntentHandler(&a);
        QVERIFY(manager->requestAction(intent, {1, QStringLiteral("two")}, false, true, QStringLiteral("spoken")));
        QCOMPARE(a.requests.constLast().data, QList<QVariant>({1, QStringLiteral("two")}));
        QVERIFY(a.requests.constLast().vrEvent);
        QCOMPARE(a.requests.constLast().vrEventData, QVariant(QStringLiteral("spoken")));

        QVERIFY(manager->requestAction(intent));
        QCOMPARE(a.requests.constLast().data, QList<QVariant>());
        QVERIFY(!a.requests.constLast().vrEvent);
        QVERIFY(!a.requests.constLast().vrEventData.isValid());
    }

    void qmlMayLeaveOutArguments_data()
    {
        QTest::addColumn<QString>("arguments");
        QTest::addColumn<QList<QVariant>>("data");
        QTest::addColumn<bool>("vrEvent");
        QTest::addColumn<QVariant>("vrEventData");
        QTest::newRow("intent") << QString() << QList<QVariant>() << false << QVariant();
        QTest::newRow("data") << QStringLiteral(", ['a', 2]") << QList<QVariant>({QStringLiteral("a"), 2}) << false
                              << QVariant();
        QTest::newRow("exclusive") << QStringLiteral(", [], true") << QList<QVariant>() << false << QVariant();
        QTest::newRow("spoken") << QStringLiteral(", [], false, true") << QList<QVariant>() << true << QVariant();
        QTest::newRow("all") << QStringLiteral(", [], false, true, 'x'") << QList<QVariant>() << true
                             << QVariant(QStringLiteral("x"));
        QTest::newRow("a record") << QStringLiteral(", [], false, true, {slot: 'x'}") << QList<QVariant>() << true
                                  << QVariant(QVariantMap{{QStringLiteral("slot"), QStringLiteral("x")}});
        QTest::newRow("a list") << QStringLiteral(", [], false, true, [1]") << QList<QVariant>() << true
                                << QVariant(QVariantList{1});
    }

    void qmlMayLeaveOutArguments()
    {
        QFETCH(QString, arguments);
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent});
        manager->registerIntentHandler(&a);
        QCOMPARE(evaluate(QStringLiteral("HmiIntents.requestAction(%1%2)").arg(intent).arg(arguments)), QVariant(true));
        QTEST(a.requests.constLast().data, "data");
        QTEST(a.requests.constLast().vrEvent, "vrEvent");
        QTEST(a.requests.constLast().vrEventData, "vrEventData");
    }

    void aMonitorNeedsAHandler()
    {
        const int intent = newIntent();
        QVERIFY(!manager->intentMonitor(intent));
        QCOMPARE(log->take(core, QtWarningMsg), {QStringLiteral("Not a handled intent type: %1").arg(intent)});
    }

    void thereIsOneMonitorForAnIntent()
    {
        const int intent = newIntent();
        const int other = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent, other});
        manager->registerIntentHandler(&a);
        HmiIntentMonitor* const monitor = manager->intentMonitor(intent);
        QVERIFY(monitor);
        QCOMPARE(monitor->parent(), manager);
        QCOMPARE(manager->intentMonitor(intent), monitor);
        QVERIFY(manager->intentMonitor(other) != monitor);
    }

    void aDeletedMonitorIsReplaced()
    {
        const int intent = newIntent();
        FakeHandler a(QStringLiteral("A"), {intent});
        manager->registerIntentHandler(&a);
        delete manager->intentMonitor(intent);
        HmiIntentMonitor* const monitor = manager->intentMonitor(intent);
        QVERIFY(monitor);
        QVERIFY(monitor->enabled());
        QCOMPARE(manager->intentMonitor(intent), monitor);
    }

    void aMonitorKnowsTheHandlersOfItsBeginning()
    {
        const int intent = newIntent();
        FakeHandler early(QStringLiteral("early"), {intent});
        early.enabled = false;
        manager->registerIntentHandler(&early);
        const HmiIntentMonitor* const monitor = manager->intentMonitor(intent);
        QVERIFY(!monitor->enabled());
        FakeHandler late(QStringLiteral("late"), {intent});
        manager->registerIntentHandler(&late);
        late.setEnabled(intent, true);
        QVERIFY(!manager->intentMonitor(intent)->enabled());
        early.setEnabled(intent, true);
        QVERIFY(monitor->enabled());
    }

    void goneHandlersGiveAMonitorThatIsNeverEnabled()
    {
        const int intent = newIntent();
        {
            FakeHandler a(QStringLiteral("A"), {intent});
            manager->registerIntentHandler(&a);
        }
        const HmiIntentMonitor* const monitor = manager->intentMonitor(intent);
        QVERIFY(monitor);
        QVERIFY(!monitor->enabled());
    }

    /// Requests of many threads are served one at a time and none is lost, while handlers and monitors come and go.
    void requestsOfManyThreadsAreSerialised()
    {
        constexpr int threadCount = 6;
        constexpr int requestsEach = 2000;
        const int intent = newIntent();
        struct Counter : HmiIntentHandler
        {
            explicit Counter(int intent) { addAction(intent); }
            bool performAction(int, const QList<QVariant>&, bool, const QVariant&) override
            {
                overlapped = overlapped || busy.exchange(true);
                ++plain;
                busy = false;
                return true;
            }
            int plain = 0; // guarded by the manager's mutex alone
            std::atomic<bool> busy{false};
            bool overlapped = false;
        };
        Counter counter(intent);
        manager->registerIntentHandler(&counter);

        std::atomic<int> succeeded{0};
        std::vector<std::unique_ptr<QThread>> threads;
        for (int i = 0; i < threadCount; ++i) {
            threads.emplace_back(QThread::create([&] {
                for (int request = 0; request < requestsEach; ++request)
                    succeeded += manager->requestAction(intent, {request}, request % 2 == 0) ? 1 : 0;
            }));
            threads.back()->start();
        }
        for (int i = 0; i < 200; ++i) {
            const int shortLived = newIntent();
            {
                FakeHandler handler(QStringLiteral("short"), {shortLived});
                manager->registerIntentHandler(&handler);
                QVERIFY(manager->requestAction(shortLived));
                QVERIFY(manager->intentMonitor(shortLived)->enabled());
                if (i % 2 == 0)
                    delete manager->intentMonitor(shortLived);
            }
            QVERIFY(manager->canPerformAction(shortLived));
            delete manager->intentMonitor(intent);
            QVERIFY(manager->intentMonitor(intent)->enabled());
        }
        for (const auto& thread : threads)
            QVERIFY(thread->wait(60000));
        QCOMPARE(succeeded.load(), threadCount * requestsEach);
        QCOMPARE(counter.plain, threadCount * requestsEach);
        QVERIFY(!counter.overlapped);
    }

    /// Requests with sequence numbers, from several threads at once.
    void noRequestIsLostDoubledOrReordered()
    {
        constexpr int threads = 4;
        constexpr int requests = 25000;
        const int intent = newIntent();
        FakeHandler first(QStringLiteral("first"), {intent});
        FakeHandler second(QStringLiteral("second"), {intent});
        manager->registerIntentHandler(&first);
        manager->registerIntentHandler(&second);
        std::vector<std::unique_ptr<QThread>> requesters;
        for (int thread = 0; thread < threads; ++thread) {
            requesters.emplace_back(QThread::create([this, intent, thread] {
                for (int number = 0; number < requests; ++number)
                    manager->requestAction(intent, {thread, number});
            }));
            requesters.back()->start();
        }
        for (const auto& requester : requesters)
            QVERIFY(requester->wait(60000));

        for (const FakeHandler* const handler : {&first, &second}) {
            QCOMPARE(handler->requests.size(), threads * requests);
            int next[threads] = {};
            for (const FakeHandler::Request& request : handler->requests)
                QCOMPARE(request.data[1].toInt(), next[request.data[0].toInt()]++);
        }
    }
};

QTEST_GUILESS_MAIN(HmiIntentManagerTest)
#include "tst_hmiintentmanager.moc"
