// SPDX-License-Identifier: MIT
#include "bridgefixture.h"

#include <QDir>

using namespace AL2HMIBridge;

/// The threads may be terminated whatever they do.
class TerminationTest : public QObject
{
    Q_OBJECT

private:
    static int openDescriptors()
    {
        return int(QDir(QStringLiteral("/proc/self/fd"))
                       .entryList(QDir::NoDotAndDotDot | QDir::AllEntries | QDir::System)
                       .size());
    }

    static bool end(QThread* thread)
    {
        thread->terminate();
        return thread->wait(FakePeer::deadline);
    }

private Q_SLOTS:
    void twoHundredTimesInAnyState()
    {
        BridgeFixture bridge;
        const QByteArray state("{\"source\":\"GlobalSource\",\"state\":{\"volume\":5}}\n");
        const QByteArray keys("{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,0]}\n");
        int before = 0;
        for (int cycle = 0; cycle < 200; ++cycle) {
            if (cycle == 10)
                before = openDescriptors();
            bridge.startMessages();
            bridge.startPriority();
            bridge.startTouch();
            PeerSocket messages;
            PeerSocket priority;
            if (cycle % 5 > 0) // else: terminated while they start or connect
                messages = bridge.peer.accept("messages");
            if (cycle % 5 > 1) // else: before the greeting
                QVERIFY(messages.greetWithSnapshot(cycle % 5 > 2 ? state.repeated(100) : state));
            if (cycle % 5 > 2) // while they receive, and while the inbox is full
                messages.sendSome(state.repeated(3000));
            if (cycle % 5 > 3) {
                priority = bridge.peer.accept("priority");
                QVERIFY(priority.greet());
                priority.sendSome(keys.repeated(3000));
                QTRY_VERIFY(BridgeFixture::connected());
                GlobalSource::instance()->sendShortSeekUp();
            }
            QVERIFY(end(bridge.priority));
            QVERIFY(end(bridge.messages));
            QVERIFY(end(bridge.touch));
            if (cycle % 2) // the same objects begin again every other time
                bridge.stop();
            else
                delete bridge.touch;
        }
        bridge.stop();
        QCOMPARE(openDescriptors(), before);
        QCoreApplication::sendPostedEvents();
        for (const auto channel : {BridgeEndpoint::Messages, BridgeEndpoint::Priority, BridgeEndpoint::Touch})
            QVERIFY(!BridgeConnection::instance()->channelConnected(channel));
        bridge.takeWarnings(); // half lines and lost calls depend on the moment
    }

    void terminationReportsTheLostPeer()
    {
        BridgeFixture bridge;
        bridge.startMessages();
        PeerSocket messages = bridge.peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        QVERIFY(end(bridge.messages));
        QTRY_VERIFY(!BridgeFixture::connected());
        QVERIFY(messages.waitForHangUp());
        bridge.messages->begin();
        PeerSocket again = bridge.peer.accept("messages");
        QVERIFY(again.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
    }

    void destructionEndsARunningThread()
    {
        BridgeFixture bridge;
        bridge.startPriority();
        PeerSocket priority = bridge.peer.accept("priority");
        QVERIFY(priority.greet());
        delete bridge.priority;
        QVERIFY(priority.waitForHangUp());
    }
};

QTEST_GUILESS_MAIN(TerminationTest)
#include "tst_termination.moc"
