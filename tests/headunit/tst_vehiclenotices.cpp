// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "vehiclenotices.h"

#include <AL2HMIBridge/BridgeTester>

#include <QTest>

#include <memory>
#include <optional>
#include <utility>

using AL2HMIBridge::BridgeTester;

/// What the vehicle's state says that a driver should know.
class VehicleNoticesTest : public QObject
{
    Q_OBJECT

    static bool setCold(double celsius)
    {
        return BridgeTester::setState("GlobalSource", {{"outsideTemperature", celsius}});
    }

    static bool setCall(bool rings, bool connected)
    {
        return BridgeTester::setState("PhoneSource", {{"incomingCall", rings},
                                                      {"callConnected", connected},
                                                      {"callerName", QStringLiteral("Ada")},
                                                      {"callerNumber", QStringLiteral("+1 555")}});
    }

    QList<int> takeKinds()
    {
        QList<int> kinds;
        for (const Message& message : std::as_const(m_noticed))
            kinds.append(message.kind);
        m_noticed.clear();
        return kinds;
    }

    std::optional<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;
    std::unique_ptr<VehicleNotices> m_notices;
    QVector<Message> m_noticed;

private Q_SLOTS:
    void init()
    {
        m_log.emplace();
        m_vehicle = std::make_unique<BridgeTester>();
        QVERIFY(BridgeTester::setState("GlobalSource", {{"clockText", QStringLiteral("10:42")}}));
        QVERIFY(setCold(20));
        m_notices = std::make_unique<VehicleNotices>(nullptr);
        connect(m_notices.get(), &VehicleNotices::noticed, this,
                [this](const Message& message) { m_noticed.append(message); });
    }

    void cleanup()
    {
        m_notices.reset();
        m_noticed.clear();
        m_vehicle.reset();
        m_log.reset();
    }

    void beforeTheVehicleHasToldItsStateThereIsNothingToTell()
    {
        BridgeTester::resetState();
        QVERIFY(setCold(-10));
        QVERIFY(setCall(true, false));
        QVERIFY(setCall(false, false));
        QCOMPARE(takeKinds(), QList<int>());
    }

    void coldIsToldOnceUntilItIsWarmAgain_data()
    {
        QTest::addColumn<QList<double>>("celsius");
        QTest::addColumn<int>("notices");
        QTest::newRow("warm") << QList<double>{10, 4, 3.1} << 0;
        QTest::newRow("cold") << QList<double>{3} << 1;
        QTest::newRow("colder and colder") << QList<double>{3, 1, -20} << 1;
        QTest::newRow("up and down") << QList<double>{3, 4, 3, 5, 2} << 1;
        QTest::newRow("warm in between") << QList<double>{3, 5.5, 2} << 2;
    }

    void coldIsToldOnceUntilItIsWarmAgain()
    {
        QFETCH(QList<double>, celsius);
        for (const double degrees : std::as_const(celsius))
            QVERIFY(setCold(degrees));
        const QList<int> kinds = takeKinds();
        QTEST(int(kinds.size()), "notices");
        QCOMPARE(int(kinds.count(Message::IcyRoad)), int(kinds.size()));
    }

    void aCallThatNobodyTookIsTold()
    {
        QVERIFY(setCall(true, false));
        QCOMPARE(takeKinds(), QList<int>());
        QVERIFY(BridgeTester::setState(
            "PhoneSource", {{"incomingCall", false}, {"callerName", QString()}, {"callerNumber", QString()}}));
        QCOMPARE(m_noticed.size(), 1);
        QCOMPARE(m_noticed.constFirst().sender, QStringLiteral("Ada"));
        QCOMPARE(m_noticed.constFirst().number, QStringLiteral("+1 555"));
        QCOMPARE(takeKinds(), QList<int>{Message::MissedCall});
    }

    void aCallThatWasTakenIsNoNews()
    {
        QVERIFY(setCall(true, false));
        QVERIFY(setCall(false, true));
        QVERIFY(setCall(false, false));
        QCOMPARE(takeKinds(), QList<int>());
    }

    void anEmptyPhoneIsToldWhileItIsThere()
    {
        QVERIFY(BridgeTester::setState("PhoneSource", {{"batteryLevel", 10}}));
        QCOMPARE(takeKinds(), QList<int>()); // there is none
        QVERIFY(BridgeTester::setState("PhoneSource", {{"deviceName", QStringLiteral("A phone")}}));
        QCOMPARE(m_noticed.size(), 1);
        QCOMPARE(m_noticed.constFirst().sender, QStringLiteral("A phone"));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"batteryLevel", 9}}));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"batteryLevel", 20}}));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"batteryLevel", 15}}));
        QCOMPARE(takeKinds(), QList<int>{Message::PhoneBattery});
        QVERIFY(BridgeTester::setState("PhoneSource", {{"batteryLevel", 80}}));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"batteryLevel", 15}}));
        QCOMPARE(takeKinds(), QList<int>{Message::PhoneBattery});
    }
};

QTEST_GUILESS_MAIN(VehicleNoticesTest)
#include "tst_vehiclenotices.moc"
