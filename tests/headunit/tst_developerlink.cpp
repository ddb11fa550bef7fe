// SPDX-License-Identifier: MIT
#include "developerlink.h"
#include "logcapture.h"

#include <AL2HMIBridge/BridgeTester>
#include <HmiCore/HardKeyController>
#include <HmiCore/HmiIntentManager>

#include <QLoggingCategory>
#include <QTest>
#include <QThread>

#include <memory>
#include <optional>

using AL2HMIBridge::BridgeTester;
using HmiCore::HardKeyController;
using HmiCore::HmiIntentManager;

class DeveloperLinkTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<BridgeTester> bridge;
    std::unique_ptr<DeveloperLink> link;

    static void want(bool wanted) { BridgeTester::setState("DeveloperSource", {{"decisionsWanted", wanted}}); }

    QStringList callsAfterTheEventLoop()
    {
        QCoreApplication::sendPostedEvents();
        return BridgeTester::takeCalls();
    }

private Q_SLOTS:
    void initTestCase() { HardKeyController::instance(); }
    void init()
    {
        log.emplace();
        bridge.emplace();
        link = std::make_unique<DeveloperLink>(nullptr);
    }
    void cleanup()
    {
        bridge.reset();
        link.reset();
        log.reset();
    }

    void saysNothingUnasked()
    {
        BridgeTester::sendEvent("KeySource", "keyEvent", {200, 1});
        QCOMPARE(callsAfterTheEventLoop(), QStringList());
        QVERIFY(log->records().isEmpty());
    }

    void reportsKeysWhileAsked()
    {
        want(true);
        BridgeTester::sendEvent("KeySource", "keyEvent", {200, 1});
        const QStringList calls = callsAfterTheEventLoop();
        QCOMPARE(calls.size(), 1);
        QVERIFY2(
            calls.constFirst().startsWith(QLatin1String("DeveloperSource.reportDecision(\"key 200 state 1: nothing; ")),
            qPrintable(calls.constFirst()));
        QCOMPARE(log->take(QStringLiteral("kest.hmicore.decisions"), QtDebugMsg).size(), 1); // the log has it too

        want(false);
        BridgeTester::sendEvent("KeySource", "keyEvent", {200, 1});
        QCOMPARE(callsAfterTheEventLoop(), QStringList());
    }

    void reportsIntentsOfOtherThreads()
    {
        want(true);
        const std::unique_ptr<QThread> thread(
            QThread::create([] { HmiIntentManager::instance()->requestAction(HmiIntentManager::ShowApps); }));
        HmiIntentManager::instance();
        thread->start();
        QVERIFY(thread->wait(30000));
        QCOMPARE(log->take(QStringLiteral("kest.hmicore"), QtWarningMsg).size(), 1);
        const QStringList calls = callsAfterTheEventLoop();
        QCOMPARE(calls.size(), 1);
        QVERIFY(calls.constFirst().contains(QLatin1String("intent 55 ShowApps: no handler found")));
    }

    void answersFencesAfterWhatIsQueued()
    {
        QStringList order;
        QMetaObject::invokeMethod(
            this, [&order] { order.append(QStringLiteral("work %1").arg(BridgeTester::takeCalls().size())); },
            Qt::QueuedConnection);
        BridgeTester::sendEvent("KeySource", "fence", {7});
        BridgeTester::sendEvent("DeveloperSource", "fence", {8});
        QCOMPARE(callsAfterTheEventLoop(), QStringList({QStringLiteral("DeveloperSource.fenceReached(7)"),
                                                        QStringLiteral("DeveloperSource.fenceReached(8)")}));
        QCOMPARE(order, {QStringLiteral("work 0")});
    }

    void leavesTheRulesOfOthersAlone()
    {
        link.reset();
        QLoggingCategory::setFilterRules(QStringLiteral("some.category.debug=true"));
        const QLoggingCategory category("some.category", QtWarningMsg);
        link = std::make_unique<DeveloperLink>(nullptr);
        QVERIFY(category.isDebugEnabled());
        QLoggingCategory::setFilterRules(QString());
    }

    void messagesOfThreadsWhileItGoesAreSafe()
    {
        QLoggingCategory::setFilterRules(QStringLiteral("kest.hmicore.decisions.debug=true"));
        std::atomic<bool> stop{false};
        const std::unique_ptr<QThread> thread(QThread::create([&stop] {
            while (!stop)
                HmiIntentManager::instance()->requestAction(HmiIntentManager::ShowApps);
        }));
        thread->start();
        for (int i = 0; i < 200; ++i) {
            link.reset();
            link = std::make_unique<DeveloperLink>(nullptr);
        }
        stop = true;
        QVERIFY(thread->wait(30000));
        QLoggingCategory::setFilterRules(QString());
        log->take(QStringLiteral("kest.hmicore"), QtWarningMsg);
    }
};

QTEST_GUILESS_MAIN(DeveloperLinkTest)
#include "tst_developerlink.moc"
