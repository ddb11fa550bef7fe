// SPDX-License-Identifier: MIT
#include "bridgefixture.h"

#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/KeySource>

#include <QSignalSpy>
#include <QTimer>

#include <atomic>
#include <thread>

using namespace AL2HMIBridge;

/// Floods, full queues and calls that find no peer.
class FlowTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<BridgeFixture> m_bridge;

    static QByteArray keyLine(int number)
    {
        return "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[" + QByteArray::number(number) + ",0]}\n";
    }

    static QByteArray frequencyLine(int number)
    {
        return "{\"source\":\"FMTunerSource\",\"state\":{\"frequency\":\"" + QByteArray::number(number) + "\"}}\n";
    }

private Q_SLOTS:
    void init() { m_bridge = std::make_unique<BridgeFixture>(); }
    void cleanup() { m_bridge.reset(); }

    void noKeyIsLostOrReordered()
    {
        constexpr int count = 1000000;
        m_bridge->startPriority();
        PeerSocket keys = m_bridge->peer.accept("priority");
        QVERIFY(keys.greet());
        int next = 0;
        bool inOrder = true;
        QObject context;
        connect(KeySource::instance(), &KeySource::keyEvent, &context, [&](int keyId) { inOrder &= keyId == next++; });
        std::thread sender([&keys] {
            for (int i = 0; i < count; i += 100) {
                QByteArray lines;
                for (int j = i; j < i + 100; ++j)
                    lines += keyLine(j);
                if (!keys.send(lines))
                    return;
            }
        });
        const bool arrived = QTest::qWaitFor([&] { return next == count; }, 240000);
        sender.join();
        QCOMPARE(next, count);
        QVERIFY(arrived);
        QVERIFY(inOrder);
    }

    void aPeerThatIsTooFastHasToWait()
    {
        m_bridge->startPriority();
        PeerSocket keys = m_bridge->peer.accept("priority");
        QVERIFY(keys.greet());
        QTRY_VERIFY(BridgeConnection::instance()->channelConnected(BridgeEndpoint::Priority));
        int received = 0;
        QObject context;
        connect(KeySource::instance(), &KeySource::keyEvent, &context, [&] { ++received; });
        // the GUI thread does not look: the inbox fills, then the socket, then nothing more is taken
        QByteArray flood;
        for (int i = 0; i < 1000; ++i)
            flood += keyLine(1000000 + i);
        qint64 sent = 0;
        int refused = 0;
        QElapsedTimer quiet;
        quiet.start();
        while (quiet.elapsed() < 300 && sent < 64 * 1024 * 1024) {
            const int offset = int(sent % flood.size());
            const qint64 count = keys.sendSome(flood.mid(offset));
            if (count > 0) {
                sent += count;
                quiet.restart();
            } else {
                ++refused;
            }
        }
        QVERIFY(refused > 0);
        QVERIFY2(sent < 4 * 1024 * 1024, qPrintable(QString::number(sent)));
        const qint64 rest = (flood.size() - sent % flood.size()) % flood.size();
        std::thread sender([&] { keys.send(flood.right(int(rest))); });
        const int lines = int((sent + rest) / keyLine(1000000).size());
        const bool arrived = QTest::qWaitFor([&] { return received == lines; }, 30000);
        sender.join();
        QCOMPARE(received, lines);
        QVERIFY(arrived);
    }

    void keysOvertakeAFloodOfState()
    {
        m_bridge->startMessages();
        m_bridge->startPriority();
        PeerSocket messages = m_bridge->peer.accept("messages");
        PeerSocket keys = m_bridge->peer.accept("priority");
        QVERIFY(messages.greetWithSnapshot());
        QVERIFY(keys.greet());
        QTRY_VERIFY(BridgeFixture::synchronised()
                    && BridgeConnection::instance()->channelConnected(BridgeEndpoint::Priority));
        constexpr int states = 60000;
        QString atKey;
        int stateChanges = 0;
        bool timerRan = false;
        QObject context;
        connect(FMTunerSource::instance(), &FMTunerSource::frequencyChanged, &context, [&] {
            QElapsedTimer work; // a screen that has something to do on every change
            work.start();
            while (work.nsecsElapsed() < 10000)
                continue;
            if (++stateChanges != 10) // the flood is being delivered; a key comes now
                return;
            QVERIFY(keys.send(keyLine(7)));
            QTimer::singleShot(0, &context, [&] { timerRan = atKey.isEmpty() || stateChanges < states; });
        });
        connect(KeySource::instance(), &KeySource::keyEvent, &context,
                [&] { atKey = FMTunerSource::instance()->frequency(); });
        std::thread sender([&messages] {
            QByteArray lines;
            for (int i = 1; i <= states; ++i)
                lines += frequencyLine(i);
            messages.send(lines);
        });
        const bool arrived = QTest::qWaitFor([&] { return stateChanges == states && !atKey.isEmpty(); }, 60000);
        sender.join();
        QVERIFY(arrived);
        QCOMPARE(stateChanges, states);
        QVERIFY2(!atKey.isEmpty() && atKey.toInt() < states / 2, qPrintable(atKey));
        QVERIFY(timerRan);
    }

    void callsWithoutAPeerAreNotDeliveredLater()
    {
        m_bridge->startMessages();
        GlobalSource::instance()->sendShortSeekUp();
        QVERIFY(m_bridge->log.takeOne(
            QtWarningMsg, QStringLiteral("Call dropped: GlobalSource.sendShortSeekUp - no peer is connected")));
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        GlobalSource::instance()->requestBeepSound();
        QCOMPARE(messages.readLine(),
                 QByteArray("{\"args\":[],\"call\":\"requestBeepSound\",\"source\":\"GlobalSource\"}"));
    }

    void callsLeaveOnlyAfterTheGreeting()
    {
        m_bridge->startMessages();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.isOpen());
        GlobalSource::instance()->sendShortSeekUp();
        QVERIFY(m_bridge->log.takeOne(
            QtWarningMsg, QStringLiteral("Call dropped: GlobalSource.sendShortSeekUp - no peer is connected")));
    }

    void aPeerThatDoesNotReadFillsABoundedQueue()
    {
        m_bridge->startMessages();
        PeerSocket first = m_bridge->peer.accept("messages");
        QVERIFY(first.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        const QString text(60000, QLatin1Char('x'));
        int calls = 0;
        while (m_bridge->log.messages(QStringLiteral("al2hmi.bridge"), QtWarningMsg).isEmpty() && calls < 1000) {
            FMTunerSource::instance()->tune(text, QString());
            ++calls;
        }
        QVERIFY(calls > 10 && calls < 100);
        QCOMPARE(m_bridge->takeWarnings(),
                 QStringList(QStringLiteral("Call dropped: FMTunerSource.tune - too much waits to be sent")));

        // what the lost peer did not read is reported once and never reaches the next one
        first.close();
        QTRY_VERIFY(!BridgeFixture::connected());
        const QStringList warnings = m_bridge->takeWarnings();
        QCOMPARE(warnings.size(), 1);
        const int lost =
            warnings.constFirst().section(QStringLiteral("before it read "), 1).section(QLatin1Char(' '), 0, 0).toInt();
        QVERIFY2(lost > 5 && lost < calls, qPrintable(warnings.constFirst()));
        PeerSocket second = m_bridge->peer.accept("messages");
        QVERIFY(second.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        GlobalSource::instance()->requestBeepSound();
        QCOMPARE(second.readLine(),
                 QByteArray("{\"args\":[],\"call\":\"requestBeepSound\",\"source\":\"GlobalSource\"}"));
    }

    void aSlowPeerGetsAllCallsInOrder()
    {
        m_bridge->startMessages();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        const QString text(20000, QLatin1Char('x'));
        constexpr int calls = 50; // a megabyte: more than the socket holds
        for (int i = 0; i < calls; ++i)
            FMTunerSource::instance()->tune(text + QString::number(i), QString());
        for (int i = 0; i < calls; ++i)
            QVERIFY(messages.readLine().contains("x" + QByteArray::number(i) + "\""));
    }

    void aCallLongerThanALineIsRefused()
    {
        m_bridge->startMessages();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        FMTunerSource::instance()->tune(QString(1024 * 1024, QLatin1Char('x')), QString());
        QCOMPARE(m_bridge->takeWarnings(),
                 QStringList(QStringLiteral("Call dropped: FMTunerSource.tune - it is longer than a line may be")));
        GlobalSource::instance()->requestBeepSound();
        QVERIFY(messages.readLine().contains("requestBeepSound"));
    }
};

QTEST_GUILESS_MAIN(FlowTest)
#include "tst_flow.moc"
