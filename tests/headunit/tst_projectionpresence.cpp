// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "projectionpresence.h"

#include <AL2HMIBridge/BridgeTester>

#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

using AL2HMIBridge::BridgeTester;

class ProjectionPresenceTest : public QObject
{
    Q_OBJECT

    std::optional<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log.emplace();
        m_vehicle = std::make_unique<BridgeTester>();
    }

    void cleanup()
    {
        m_vehicle.reset();
        m_log.reset();
    }

    void tellsWhichPhoneIsThereAndHow_data()
    {
        QTest::addColumn<int>("mode");
        QTest::addColumn<int>("kind");
        QTest::newRow("none") << 0 << int(ProjectionPresence::None);
        QTest::newRow("on the cable") << 1 << int(ProjectionPresence::Cable);
        QTest::newRow("without") << 2 << int(ProjectionPresence::Air);
        QTest::newRow("a kind of later") << 3 << int(ProjectionPresence::Air);
    }

    void tellsWhichPhoneIsThereAndHow()
    {
        QFETCH(int, mode);
        const ProjectionPresence presence(nullptr);
        QVERIFY(BridgeTester::setState("ProjectionSource",
                                       {{"projectionMode", mode}, {"projectedDeviceName", QStringLiteral("A phone")}}));
        QTEST(int(presence.kind()), "kind");
        QCOMPARE(presence.isConnected(), mode != 0);
        QCOMPARE(presence.phoneName(), mode ? QStringLiteral("A phone") : QString());
    }

    void tellsOfEachChange()
    {
        const ProjectionPresence presence(nullptr);
        QSignalSpy changed(&presence, &ProjectionPresence::changed);
        QVERIFY(BridgeTester::setState("ProjectionSource", {{"projectionMode", 2}}));
        QCOMPARE(changed.size(), 1);
        QVERIFY(BridgeTester::setState("ProjectionSource", {{"projectedDeviceName", QStringLiteral("Another")}}));
        QCOMPARE(changed.size(), 2);
        QVERIFY(BridgeTester::setState("ProjectionSource", {{"projectedTitle", QStringLiteral("A song")}}));
        QCOMPARE(changed.size(), 2);
    }

    void withoutAWordOnItProjectionIsOffered() { QVERIFY(ProjectionPresence(nullptr).isOffered()); }
};

QTEST_GUILESS_MAIN(ProjectionPresenceTest)
#include "tst_projectionpresence.moc"
