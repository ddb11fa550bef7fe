// SPDX-License-Identifier: MIT
#include "bridgefixture.h"

#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/HMI2ALMessageSender>
#include <AL2HMIBridge/KeySource>

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSignalSpy>

#include <pwd.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

using namespace AL2HMIBridge;

/// Connecting, greeting, snapshots and what happens when the peer goes.
class ReceiveThreadsTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<BridgeFixture> m_bridge;

    static QByteArray state(const char* source, const char* fields)
    {
        return QByteArray("{\"source\":\"") + source + "\",\"state\":{" + fields + "}}\n";
    }

private Q_SLOTS:
    void init() { m_bridge = std::make_unique<BridgeFixture>(); }
    void cleanup() { m_bridge.reset(); }

    void eachThreadConnectsItsChannel()
    {
        m_bridge->startMessages();
        m_bridge->startPriority();
        m_bridge->startTouch();
        PeerSocket messages = m_bridge->peer.accept("messages");
        PeerSocket priority = m_bridge->peer.accept("priority");
        PeerSocket touch = m_bridge->peer.accept("touch");
        QVERIFY(messages.greet() && priority.greet() && touch.greet());
        for (const auto channel : {BridgeEndpoint::Messages, BridgeEndpoint::Priority, BridgeEndpoint::Touch})
            QTRY_VERIFY(BridgeConnection::instance()->channelConnected(channel));

        QSignalSpy keys(KeySource::instance(), &KeySource::keyEvent);
        QSignalSpy touched(m_bridge->touch, &TouchInputReceiverThread::passThroughViewTouched);
        QVERIFY(priority.sendLine("{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,0]}"));
        QVERIFY(touch.sendLine("{\"source\":\"TouchInput\",\"event\":\"passThroughViewTouched\",\"args\":[]}"));
        QTRY_COMPARE(keys.size(), 1);
        QTRY_COMPARE(touched.size(), 1);

        GlobalSource::instance()->setAudioSource(GlobalSource::AudioNext, -1);
        QCOMPARE(messages.readLine(),
                 QByteArray("{\"args\":[12,-1],\"call\":\"setAudioSource\",\"source\":\"GlobalSource\"}"));
        m_bridge->touch->setMobileNavTouchParamsOffset(true, 3, -4);
        QCOMPARE(
            touch.readLine(),
            QByteArray("{\"args\":[true,3,-4],\"call\":\"setMobileNavTouchParamsOffset\",\"source\":\"TouchInput\"}"));
    }

    void callsOfAnyNameAreOneLineOfJson()
    {
        m_bridge->startMessages();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greet());
        QTRY_VERIFY(BridgeConnection::instance()->channelConnected(BridgeEndpoint::Messages));
        const QString source = QStringLiteral("A \"source\"\n");
        for (const QString& call : {QString(), QStringLiteral("set_it"), QString::fromUtf8("größer"), source}) {
            const QJsonArray arguments{source, QJsonValue(), 0.5};
            QVERIFY(HMI2ALMessageSender::instance()->send(source, call, arguments));
            const QJsonObject expected{{QStringLiteral("source"), source},
                                       {QStringLiteral("call"), call},
                                       {QStringLiteral("args"), arguments}};
            const QByteArray line = messages.readLine();
            QCOMPARE(line, QJsonDocument(expected).toJson(QJsonDocument::Compact));
        }
    }

    void createInstanceGivesTheOneThreadThatLives()
    {
        MessageReceiveThread* const thread = MessageReceiveThread::createInstance(&m_bridge->owner);
        QCOMPARE(MessageReceiveThread::createInstance(nullptr), thread);
        QCOMPARE(thread->parent(), &m_bridge->owner);
        delete thread;
        QCOMPARE(MessageReceiveThread::createInstance(&m_bridge->owner)->parent(), &m_bridge->owner);
        QCOMPARE(MessageReceivePriorityQueueThread::createInstance(&m_bridge->owner)->parent(), &m_bridge->owner);
    }

    void theHmiMayStartBeforeItsPeer()
    {
        m_bridge->peer.die();
        m_bridge->startMessages();
        QVERIFY(!QTest::qWaitFor([] { return BridgeFixture::connected(); }, 200)); // some attempts fail first
        m_bridge->peer.listen();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
    }

    void peerThatDoesNotSpeakTheProtocolIsLeft_data()
    {
        QTest::addColumn<QByteArray>("line");
        QTest::addColumn<QString>("problem");
        const QString version = QStringLiteral("this side speaks protocol version 1 only");
        QTest::newRow("newer") << QByteArray("{\"protocol\":2,\"peer\":\"application-layer\"}") << version;
        QTest::newRow("text") << QByteArray("{\"protocol\":\"1\",\"peer\":\"application-layer\"}") << version;
        QTest::newRow("none") << QByteArray("{\"peer\":\"application-layer\"}")
                              << QStringLiteral("\"source\" must be a text");
        QTest::newRow("an HMI") << QByteArray("{\"protocol\":1,\"peer\":\"hmi\"}")
                                << QStringLiteral("the first line must name the peer \"application-layer\"");
        QTest::newRow("state first") << QByteArray("{\"source\":\"GlobalSource\",\"state\":{\"volume\":3}}")
                                     << QStringLiteral("the first line must tell the protocol version");
    }

    void peerThatDoesNotSpeakTheProtocolIsLeft()
    {
        QFETCH(QByteArray, line);
        QFETCH(QString, problem);
        m_bridge->startMessages();
        PeerSocket wrong = m_bridge->peer.accept("messages");
        QVERIFY(wrong.sendLine(line));
        QVERIFY(wrong.waitForHangUp());
        QVERIFY(!BridgeFixture::connected());
        PeerSocket right = m_bridge->peer.accept("messages");
        QVERIFY(right.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        QCOMPARE(m_bridge->takeWarnings(),
                 QStringList(QStringLiteral("Line refused on messages: no greeting: ") + problem));
        QCOMPARE(GlobalSource::instance()->volume(), 0);
    }

    void peerThatSaysNothingIsLeft()
    {
        m_bridge->startMessages();
        PeerSocket silent = m_bridge->peer.accept("messages");
        QVERIFY(silent.waitForHangUp());
        PeerSocket right = m_bridge->peer.accept("messages");
        QVERIFY(right.isOpen());
        QCOMPARE(m_bridge->takeWarnings(), QStringList(QStringLiteral("Peer on messages refused: it does not greet")));
    }

    void unsafeDirectoryIsRefused_data()
    {
        QTest::addColumn<int>("mode");
        QTest::addColumn<bool>("link");
        QTest::addColumn<QString>("problem");
        QTest::newRow("others may enter")
            << 0701 << false << QStringLiteral("other users may enter it; its mode must be 0700");
        QTest::newRow("group may read") << 0740 << false
                                        << QStringLiteral("other users may enter it; its mode must be 0700");
        QTest::newRow("link") << 0700 << true << QStringLiteral("it is not a directory that can be opened");
    }

    void unsafeDirectoryIsRefused()
    {
        QFETCH(int, mode);
        QFETCH(bool, link);
        const QTemporaryDir other;
        QString directory = m_bridge->peer.directory();
        QCOMPARE(::chmod(QFile::encodeName(directory).constData(), mode_t(mode)), 0);
        if (link) {
            QVERIFY(QFile::link(directory, other.filePath(QStringLiteral("link"))));
            directory = other.filePath(QStringLiteral("link"));
        }
        BridgeEndpoint::setDirectory(directory);
        m_bridge->startMessages();
        QTRY_VERIFY(!m_bridge->log.messages(QStringLiteral("al2hmi.bridge"), QtWarningMsg).isEmpty());
        QVERIFY(!QTest::qWaitFor([] { return BridgeFixture::connected(); }, 300)); // several attempts, one warning
        QFETCH(QString, problem);
        QCOMPARE(m_bridge->takeWarnings(),
                 QStringList(QStringLiteral("Socket directory %1 refused: %2").arg(directory, problem)));

        QCOMPARE(::chmod(QFile::encodeName(m_bridge->peer.directory()).constData(), 0700), 0);
        BridgeEndpoint::setDirectory(m_bridge->peer.directory());
        QVERIFY(m_bridge->peer.accept("messages").greet());
    }

    void peerOfAnotherUserIsRefused()
    {
        // A real peer of another user takes the right to become one; nothing less would test the kernel's answer.
        if (::geteuid() != 0)
            QSKIP("only root can make a process of another user listen");
        m_bridge->peer.die();
        const QByteArray path = QFile::encodeName(m_bridge->peer.directory()) + "/messages";
        ::unlink(path.constData());
        int started[2];
        QCOMPARE(::pipe(started), 0);
        const pid_t child = ::fork();
        if (child == 0) {
            sockaddr_un address{};
            address.sun_family = AF_UNIX;
            qstrncpy(address.sun_path, path.constData(), sizeof address.sun_path);
            const int listener = ::socket(AF_UNIX, SOCK_STREAM, 0);
            const bool listens = ::bind(listener, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0
                                 && ::setuid(65534) == 0
                                 && ::listen(listener, 8) == 0; // listening is what leaves the identity
            const char told = listens ? 'y' : 'n';
            if (::write(started[1], &told, 1) == 1)
                ::pause();
            ::_exit(0);
        }
        char told = 0;
        QCOMPARE(::read(started[0], &told, 1), ssize_t(1));
        ::close(started[0]);
        ::close(started[1]);
        m_bridge->startMessages();
        const bool warned = QTest::qWaitFor(
            [this] { return !m_bridge->log.messages(QStringLiteral("al2hmi.bridge"), QtWarningMsg).isEmpty(); },
            FakePeer::deadline);
        ::kill(child, SIGKILL);
        ::waitpid(child, nullptr, 0);
        QCOMPARE(told, 'y');
        QVERIFY(warned);
        QVERIFY(!BridgeFixture::connected());
        QCOMPARE(m_bridge->takeWarnings(),
                 QStringList(QStringLiteral("Peer on messages refused: it is run by another user")));
    }

    void snapshotIsAppliedAtOnce()
    {
        m_bridge->startMessages();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greet());
        QTRY_VERIFY(BridgeFixture::connected());
        QSignalSpy synchronised(BridgeConnection::instance(), &BridgeConnection::synchronisedChanged);
        QSignalSpy volume(GlobalSource::instance(), &GlobalSource::volumeChanged);
        QStringList seen;
        QObject context;
        connect(GlobalSource::instance(), &GlobalSource::volumeChanged, &context,
                [&] { seen.append(FMTunerSource::instance()->frequency()); });
        QVERIFY(messages.send(state("GlobalSource", "\"volume\":5") + state("FMTunerSource", "\"frequency\":\"98.5\"")
                              + state("GlobalSource", "\"volume\":6")));
        QVERIFY(!QTest::qWaitFor([] { return GlobalSource::instance()->volume() != 0; }, 100));
        QVERIFY(messages.sendLine("{\"snapshot\":\"complete\"}"));
        QTRY_COMPARE(synchronised.size(), 1);
        QCOMPARE(GlobalSource::instance()->volume(), 6);
        QCOMPARE(volume.size(), 1);
        QCOMPARE(seen, QStringList(QStringLiteral("98.5"))); // all sources are stored before anybody is told
    }

    void restartedPeerBringsItsStateWithoutFlicker()
    {
        m_bridge->startMessages();
        PeerSocket first = m_bridge->peer.accept("messages");
        QVERIFY(first.greetWithSnapshot(state("GlobalSource", "\"volume\":5,\"muted\":true,\"mainAudioSource\":1")));
        QTRY_VERIFY(BridgeFixture::synchronised());
        QSignalSpy volume(GlobalSource::instance(), &GlobalSource::volumeChanged);
        QSignalSpy muted(GlobalSource::instance(), &GlobalSource::mutedChanged);
        QSignalSpy audio(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged);
        m_bridge->peer.die();
        first.close();
        QTRY_VERIFY(!BridgeFixture::connected());
        QVERIFY(!BridgeFixture::synchronised());
        QCOMPARE(GlobalSource::instance()->volume(), 5); // the screen keeps what it shows
        m_bridge->peer.listen();
        PeerSocket second = m_bridge->peer.accept("messages");
        QVERIFY(second.greetWithSnapshot(state("GlobalSource", "\"volume\":5,\"mainAudioSource\":2")));
        QTRY_VERIFY(BridgeFixture::synchronised());
        QCOMPARE(GlobalSource::instance()->volume(), 5);
        QCOMPARE(GlobalSource::instance()->muted(), false);
        QCOMPARE(GlobalSource::instance()->mainAudioSource(), GlobalSource::AudioXM);
        QCOMPARE(volume.size(), 0);
        QCOMPARE(muted.size(), 1);
        QCOMPARE(audio.size(), 1);
    }

    void snapshotThatBreaksOffChangesNothing()
    {
        m_bridge->startMessages();
        PeerSocket first = m_bridge->peer.accept("messages");
        QVERIFY(first.greetWithSnapshot(state("GlobalSource", "\"volume\":5")));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 5);
        first.close();
        PeerSocket second = m_bridge->peer.accept("messages");
        QVERIFY(second.greet());
        QVERIFY(second.send(state("GlobalSource", "\"volume\":9")));
        second.close();
        PeerSocket third = m_bridge->peer.accept("messages");
        QVERIFY(third.greet());
        QCOMPARE(GlobalSource::instance()->volume(), 5);
    }

    void peerMayDieWhileMessagesFlow()
    {
        m_bridge->startMessages();
        QByteArray flow;
        for (int i = 0; i < 2000; ++i)
            flow += state("FMTunerSource", ("\"frequency\":\"" + QByteArray::number(i) + "\"").constData());
        for (int round = 0; round < 20; ++round) {
            PeerSocket messages = m_bridge->peer.accept("messages");
            QVERIFY(messages.greetWithSnapshot());
            messages.sendSome(flow);
            if (round % 2)
                QTRY_VERIFY(BridgeFixture::connected());
        }
        PeerSocket last = m_bridge->peer.accept("messages");
        QVERIFY(last.greetWithSnapshot(state("FMTunerSource", "\"stationName\":\"North\"")));
        QTRY_COMPARE(FMTunerSource::instance()->stationName(), QStringLiteral("North"));
        QCOMPARE(FMTunerSource::instance()->frequency(), QString());
        for (const QString& warning : m_bridge->takeWarnings())
            QCOMPARE(warning, QStringLiteral("Line refused on messages: the peer hung up in the middle of a line"));
    }

    void connectorTakesThePlaceOfTheDirectory()
    {
        int pair[2];
        QCOMPARE(::socketpair(AF_UNIX, SOCK_STREAM, 0, pair), 0);
        PeerSocket peer(pair[1]);
        std::atomic<int> offered{pair[0]};
        BridgeEndpoint::setConnector([&offered](BridgeEndpoint::Channel) { return offered.exchange(-1); });
        m_bridge->startMessages();
        QVERIFY(peer.greetWithSnapshot(state("GlobalSource", "\"volume\":5")));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 5);
        m_bridge->stop();
    }

    void directoryComesFromTheEnvironment()
    {
        BridgeEndpoint::setDirectory(QString());
        const QByteArray runtime = qgetenv("XDG_RUNTIME_DIR");
        qputenv("HMI_BRIDGE_DIR", "/a/b");
        QCOMPARE(BridgeEndpoint::directory(), QStringLiteral("/a/b"));
        qunsetenv("HMI_BRIDGE_DIR");
        qputenv("XDG_RUNTIME_DIR", "/run/x");
        QCOMPARE(BridgeEndpoint::directory(), QStringLiteral("/run/x/hmi-bridge"));
        qunsetenv("XDG_RUNTIME_DIR");
        QCOMPARE(BridgeEndpoint::directory(), QDir::tempPath() + QStringLiteral("/hmi-bridge-%1").arg(::geteuid()));
        if (!runtime.isEmpty())
            qputenv("XDG_RUNTIME_DIR", runtime);
        BridgeEndpoint::setDirectory(QStringLiteral("/c"));
        QCOMPARE(BridgeEndpoint::directory(), QStringLiteral("/c"));
    }
};

QTEST_GUILESS_MAIN(ReceiveThreadsTest)
#include "tst_receivethreads.moc"
