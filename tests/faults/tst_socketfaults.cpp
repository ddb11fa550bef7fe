// SPDX-License-Identifier: MIT
#include "bridgefixture.h"
#include "faultcount.h"

#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/KeySource>

#include <QSignalSpy>

#include <sys/resource.h>
#include <sys/socket.h>
#include <unistd.h>
#include <vector>

using namespace AL2HMIBridge;

namespace {

/// No descriptor can be opened for as long as it lives.
class NoDescriptors
{
public:
    NoDescriptors()
    {
        ::getrlimit(RLIMIT_NOFILE, &m_limit);
        rlimit few = m_limit;
        few.rlim_cur = 128;
        ::setrlimit(RLIMIT_NOFILE, &few);
        for (int descriptor = ::dup(0); descriptor >= 0; descriptor = ::dup(0))
            m_taken.push_back(descriptor);
    }
    ~NoDescriptors()
    {
        ::setrlimit(RLIMIT_NOFILE, &m_limit);
        for (const int descriptor : m_taken)
            ::close(descriptor);
    }
    Q_DISABLE_COPY(NoDescriptors)

private:
    rlimit m_limit{};
    std::vector<int> m_taken;
};

} // namespace

/// Peers that stop, close one half or leave nothing to connect with. Floods and peers that do not read are in tst_flow.
class SocketFaultsTest : public QObject
{
    Q_OBJECT

    std::unique_ptr<BridgeFixture> m_bridge;

private Q_SLOTS:
    void init() { m_bridge = std::make_unique<BridgeFixture>(); }
    void cleanup() { m_bridge.reset(); }

    void aPeerThatStallsInALineHoldsUpNobodyElse()
    {
        m_bridge->startMessages();
        m_bridge->startPriority();
        PeerSocket messages = m_bridge->peer.accept("messages");
        PeerSocket priority = m_bridge->peer.accept("priority");
        QVERIFY(messages.greetWithSnapshot() && priority.greet());
        QTRY_VERIFY(BridgeFixture::synchronised());
        QVERIFY(messages.send("{\"source\":\"FMTunerSource\",\"state\":{\"frequency\":\"9"));

        QSignalSpy keys(KeySource::instance(), &KeySource::keyEvent);
        for (int key = 0; key < 100; ++key)
            QVERIFY(priority.sendLine("{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":["
                                      + QByteArray::number(key) + ",0]}"));
        QTRY_COMPARE(keys.size(), 100);
        QCOMPARE(FMTunerSource::instance()->frequency(), QString());
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioNext, -1);
        QVERIFY(messages.readLine().contains("setAudioSource"));

        QVERIFY(messages.send("8.5\"}}\n"));
        QTRY_COMPARE(FMTunerSource::instance()->frequency(), QStringLiteral("98.5"));
        QCOMPARE(m_bridge->takeWarnings(), QStringList());
    }

    void aPeerThatClosesItsSendingHalfIsLeft()
    {
        m_bridge->startMessages();
        for (int round = 0; round < faultCount(5, 200); ++round) {
            PeerSocket messages = m_bridge->peer.accept("messages");
            QVERIFY(messages.greetWithSnapshot());
            QTRY_VERIFY(BridgeFixture::synchronised());
            QCOMPARE(::shutdown(messages.fd(), SHUT_WR), 0);
            QVERIFY(messages.waitForHangUp());
            QTRY_VERIFY(!BridgeFixture::connected());
        }
        QCOMPARE(m_bridge->takeWarnings(), QStringList());
    }

    void aPeerThatClosesItsReceivingHalfIsReportedWithTheNextCall()
    {
        m_bridge->startMessages();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        QCOMPARE(::shutdown(messages.fd(), SHUT_RD), 0);
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioNext, -1);
        QCOMPARE(m_bridge->takeWarnings(),
                 QStringList(QStringLiteral("Call dropped: GlobalSource.setAudioSource - no peer is connected")));
        QVERIFY(messages.waitForHangUp()); // who cannot be told anything is no peer
        PeerSocket next = m_bridge->peer.accept("messages");
        QVERIFY(next.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioNext, -1);
        QVERIFY(next.readLine().contains("setAudioSource"));
    }

    void withoutDescriptorsItIsSaidOnceAndTriedAgain()
    {
        m_bridge->startMessages();
        PeerSocket first = m_bridge->peer.accept("messages");
        QVERIFY(first.greet());
        QTRY_VERIFY(BridgeFixture::connected());
        m_bridge->peer.die();
        first.close();
        QTRY_VERIFY(!BridgeFixture::connected());
        {
            const NoDescriptors none;
            QTRY_COMPARE(m_bridge->log.messages(QStringLiteral("al2hmi.bridge"), QtWarningMsg).size(), 1);
            // Several tries later it has still been said once.
            QVERIFY(!QTest::qWaitFor([] { return BridgeFixture::connected(); }, 700));
            QCOMPARE(m_bridge->takeWarnings(),
                     QStringList(QStringLiteral("Socket directory %1 refused: the process has no descriptor left")
                                     .arg(m_bridge->peer.directory())));
        }
        m_bridge->peer.listen();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot("{\"source\":\"GlobalSource\",\"state\":{\"volume\":5}}\n"));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 5);
        QCOMPARE(m_bridge->takeWarnings(), QStringList());
    }

    void aConnectionOutlivesTheLackOfDescriptors()
    {
        m_bridge->startMessages();
        PeerSocket messages = m_bridge->peer.accept("messages");
        QVERIFY(messages.greetWithSnapshot());
        QTRY_VERIFY(BridgeFixture::synchronised());
        const NoDescriptors none;
        QVERIFY(messages.sendLine("{\"source\":\"GlobalSource\",\"state\":{\"volume\":7}}"));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 7);
    }
};

QTEST_GUILESS_MAIN(SocketFaultsTest)
#include "tst_socketfaults.moc"
