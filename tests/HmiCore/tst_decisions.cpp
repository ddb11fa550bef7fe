// SPDX-License-Identifier: MIT
#include "fakehandler.h"
#include "logcapture.h"

#include <AL2HMIBridge/BridgeTester>
#include <HmiCore/HardKeyController>
#include <HmiCore/HmiIntentManager>

#include <QRegularExpression>
#include <QTest>

#include <optional>

using namespace AL2HMIBridge;
using namespace HmiCore;

namespace {
const QString decisions = QStringLiteral("kest.hmicore.decisions");
}

/// What developers read when they ask why a key or an intent did what it did.
class DecisionsTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<BridgeTester> bridge;

    void listen() { log.emplace(QStringLiteral("kest.hmicore.decisions.debug=true")); }

    /// The lines since the last time, without the microseconds that each must end with.
    QStringList lines()
    {
        static const QRegularExpression time(QStringLiteral("; \\d+\\.\\d us$"));
        QStringList result = log->take(decisions, QtDebugMsg);
        for (QString& line : result)
            line = line.contains(time) ? line.remove(time) : line + QStringLiteral(" (no time)");
        return result;
    }

private Q_SLOTS:
    void initTestCase() { HardKeyController::instance(); }
    void init()
    {
        listen();
        bridge.emplace();
    }
    void cleanup()
    {
        bridge.reset();
        log.reset();
    }

    void nothingIsWrittenUnlessWanted()
    {
        log.emplace();
        BridgeTester::sendEvent("KeySource", "keyEvent", {6, 0});
        QVERIFY(log->records().isEmpty());
    }

    void aKeyIsExplained()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}});
        BridgeTester::setState("FMTunerSource", {{"hdSignalLossStatus", 1}});
        BridgeTester::sendEvent("KeySource", "keyEvent", {6, 0});
        QCOMPARE(lines(), {QStringLiteral("key 6 state 0: retuneFm(); fmLostHdSignal(); saw "
                                          "ProjectionSource.projectionMode=0 SpeechSource.sessionState=0 "
                                          "SpeechSource.ttsSessionActive=0 autoStoreInProgress=0 "
                                          "GlobalSource.mainAudioSource=1 FMTunerSource.hdSignalLossStatus=1")});
    }

    void cancellingIsExplained()
    {
        BridgeTester::setState("SpeechSource", {{"sessionState", 2}, {"ttsSessionActive", true}});
        BridgeTester::setState("AMTunerSource", {{"autoStoreInProgress", true}});
        BridgeTester::sendEvent("KeySource", "keyEvent", {200, 0});
        const QStringList explained = lines();
        QCOMPARE(explained.size(), 1);
        QVERIFY2(explained.constFirst().startsWith(
                     QStringLiteral("key 200 state 0: nothing; cancelled the voice session, cancelled the spoken text, "
                                    "cancelled the autostore; saw ")),
                 qPrintable(explained.constFirst()));
    }

    void oneStepLeadsToAnother()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 16}});
        BridgeTester::sendEvent("KeySource", "keyEvent", {89, 2});
        const QStringList explained = lines();
        QCOMPARE(explained.size(), 1);
        QVERIFY2(explained.constFirst().startsWith(
                     QStringLiteral("key 89 state 2: controller.processSWCSeekUpShortPress() -> media().next(); "
                                    "mainIs<Media>(); saw ")),
                 qPrintable(explained.constFirst()));
    }

    void anIntentIsExplained()
    {
        constexpr int intent = HmiIntentManager::UserType + 1;
        FakeHandler able(QStringLiteral("able"), {intent});
        FakeHandler unable(QStringLiteral("unable"), {intent});
        unable.error = QStringLiteral("first line\nsecond line ") + QString(500, QLatin1Char('x'));
        HmiIntentManager* const manager = HmiIntentManager::instance();
        {
            FakeHandler gone(QStringLiteral("gone"), {intent});
            manager->registerIntentHandler(&gone);
        }
        manager->registerIntentHandler(&able);
        manager->registerIntentHandler(&unable);
        QVERIFY(manager->requestAction(intent, {QStringLiteral("secret number")}));
        const QStringList explained = lines();
        QCOMPARE(explained.size(), 1);
        const QString line = explained.constFirst();
        QVERIFY2(line.startsWith(QStringLiteral(
                     "intent 129 of a module: handled; FakeHandler, failed: first line second line xxx")),
                 qPrintable(line));
        QVERIFY2(line.endsWith(QStringLiteral("xxx, FakeHandler, performed it, a handler that is gone")),
                 qPrintable(line));
        QVERIFY(line.size() < 300);
        QVERIFY(!line.contains(QLatin1String("secret")));
    }

    void anIntentThatNobodyHandlesIsExplained()
    {
        QVERIFY(!HmiIntentManager::instance()->requestAction(HmiIntentManager::ShowClimate, {}, true));
        QCOMPARE(lines(), {QStringLiteral("intent 54 ShowClimate (exclusive): no handler found")});
        QCOMPARE(log->take(QStringLiteral("kest.hmicore"), QtWarningMsg).size(), 1);
    }

    void theIntentOfAKeyComesBeforeTheKey()
    {
        BridgeTester::sendEvent("KeySource", "keyEvent", {60, 2});
        const QStringList explained = lines();
        QCOMPARE(explained.size(), 2);
        QCOMPARE(explained.at(0), QStringLiteral("intent 64 RequestDisplayToggle: no handler found"));
        QVERIFY(explained.at(1).startsWith(
            QStringLiteral("key 60 state 2: request(HmiIntentManager::RequestDisplayToggle)")));
        QCOMPARE(log->take(QStringLiteral("kest.hmicore"), QtWarningMsg).size(), 1);
    }
};

QTEST_GUILESS_MAIN(DecisionsTest)
#include "tst_decisions.moc"
