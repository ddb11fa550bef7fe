// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/HMI2ALMessageSender>
#include <AL2HMIBridge/HMI2NAVMessageSender>
#include <AL2HMIBridge/TouchInputReceiverThread>

#include <QSignalSpy>
#include <QTest>

#include <memory>

using namespace AL2HMIBridge;

class BridgeTesterTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;

private Q_SLOTS:
    void init() { m_log = std::make_unique<LogCapture>(); }
    void cleanup() { m_log.reset(); }

    void callsAreRecordedInOrderAsText()
    {
        const BridgeTester tester;
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioNext, -1);
        FMTunerSource::instance()->tune(QStringLiteral("98.5"), QStringLiteral("-1"));
        AMTunerSource::instance()->toggleTpSeekInProgress(TunerSource::ModeAM, true);
        QCOMPARE(BridgeTester::takeCalls(),
                 QStringList({QStringLiteral("GlobalSource.setAudioSource(12, -1)"),
                              QStringLiteral("FMTunerSource.tune(\"98.5\", \"-1\")"),
                              QStringLiteral("AMTunerSource.toggleTpSeekInProgress(0, true)")}));
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
    }

    void callsOfTheTouchThreadAreRecorded()
    {
        const BridgeTester tester;
        TouchInputReceiverThread thread(nullptr);
        thread.setPassThroughViewVisible(true);
        thread.setMobileNavTouchParamsOffset(true, 10, -20);
        QCOMPARE(BridgeTester::takeCalls(),
                 QStringList({QStringLiteral("TouchInput.setPassThroughViewVisible(true)"),
                              QStringLiteral("TouchInput.setMobileNavTouchParamsOffset(true, 10, -20)")}));
    }

    void touchEventsReachTheThreadObject()
    {
        const BridgeTester tester;
        TouchInputReceiverThread thread(nullptr);
        QSignalSpy touched(&thread, &TouchInputReceiverThread::passThroughViewTouched);
        QVERIFY(BridgeTester::sendEvent("TouchInput", "passThroughViewTouched"));
        QCOMPARE(touched.size(), 1);
    }

    void stateIsAtItsDefaultsBeforeAndAfter()
    {
        {
            const BridgeTester tester;
            QVERIFY(BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}}));
            QCOMPARE(GlobalSource::instance()->mainAudioSource(), GlobalSource::AudioFM);
        }
        QCOMPARE(GlobalSource::instance()->mainAudioSource(), GlobalSource::AudioNone);
    }

    void anAudioSourceWithoutANameIsTaken()
    {
        const BridgeTester tester;
        QVERIFY(BridgeTester::setState("GlobalSource", {{"mainAudioSource", 77}}));
        QCOMPARE(int(GlobalSource::instance()->mainAudioSource()), 77);
    }

    void otherEnumerationsRefuseUnknownNumbers()
    {
        const BridgeTester tester;
        QVERIFY(!BridgeTester::setState("CDSource", {{"cdStatus", 4}}));
        QVERIFY(m_log->takeOne(
            QtWarningMsg, QStringLiteral("Line refused on messages: CDSource.cdStatus: 4 is not in the enumeration")));
    }

    void withoutATesterCallsWithoutAPeerAreReportedAndDropped()
    {
        GlobalSource::instance()->sendShortSeekUp();
        QVERIFY(m_log->takeOne(QtWarningMsg,
                               QStringLiteral("Call dropped: GlobalSource.sendShortSeekUp - no peer is connected")));
        QVERIFY(!HMI2NAVMessageSender::instance()->send(QStringLiteral("TouchInput"), QStringLiteral("x\ny")));
        QVERIFY(m_log->takeOne(QtWarningMsg, QStringLiteral("Call dropped: TouchInput.x?y - no peer is connected")));
        const BridgeTester tester;
        QVERIFY(HMI2ALMessageSender::instance()->send(QStringLiteral("Any"), QStringLiteral("thing"),
                                                      {1, QStringLiteral("a")}));
        QCOMPARE(BridgeTester::takeCalls(), QStringList({QStringLiteral("Any.thing(1, \"a\")")}));
    }

    void aPeerSpeaksInAnyPieces()
    {
        const BridgeTester tester;
        BridgeTester::Peer peer(BridgeEndpoint::Messages);
        QVERIFY(peer.send("{\"protocol\":1,\"peer\":\"applic"));
        QVERIFY(!BridgeConnection::instance()->connected());
        QVERIFY(peer.send("ation-layer\"}\n{\"source\":\"GlobalSource\",\"state\":{\"volume\":7}}\n{\"snap"));
        QVERIFY(BridgeConnection::instance()->connected());
        QCOMPARE(GlobalSource::instance()->volume(), 0); // until the snapshot is whole
        QVERIFY(peer.send("shot\":\"complete\"}\n"));
        QCOMPARE(GlobalSource::instance()->volume(), 7);
        QVERIFY(BridgeConnection::instance()->synchronised());
    }

    void aPeerThatHangsUpLeavesItsState()
    {
        const BridgeTester tester;
        {
            BridgeTester::Peer peer(BridgeEndpoint::Messages);
            QVERIFY(peer.send("{\"protocol\":1,\"peer\":\"application-layer\"}\n{\"snapshot\":\"complete\"}\n"));
            QVERIFY(peer.send("{\"source\":\"GlobalSource\",\"state\":{\"volume\":7}}\n{\"source\""));
        }
        QVERIFY(m_log->takeOne(QtWarningMsg,
                               QStringLiteral("Line refused on messages: the peer hung up in the middle of a line")));
        QCOMPARE(GlobalSource::instance()->volume(), 7);
        QVERIFY(!BridgeConnection::instance()->connected());
        QVERIFY(!BridgeConnection::instance()->synchronised());
    }

    void aPeerThatDoesNotGreetIsHungUpOn()
    {
        const BridgeTester tester;
        BridgeTester::Peer peer(BridgeEndpoint::Priority);
        QVERIFY(!peer.send("{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,0]}\n"));
        QVERIFY(m_log->takeOne(
            QtWarningMsg,
            QStringLiteral("Line refused on priority: no greeting: the first line must tell the protocol version")));
        QVERIFY(!peer.send("{\"protocol\":1,\"peer\":\"application-layer\"}\n"));
        QVERIFY(!BridgeConnection::instance()->channelConnected(BridgeEndpoint::Priority));
    }
};

QTEST_GUILESS_MAIN(BridgeTesterTest)
#include "tst_bridgetester.moc"
