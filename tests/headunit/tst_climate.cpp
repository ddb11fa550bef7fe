// SPDX-License-Identifier: MIT
#include "climate.h"
#include "logcapture.h"

#include <AL2HMIBridge/BridgeTester>

#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

using AL2HMIBridge::BridgeTester;

/// The rules of the climate control.
class ClimateTest : public QObject
{
    Q_OBJECT

    std::optional<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;
    std::unique_ptr<Climate> m_climate;

private Q_SLOTS:
    void initTestCase()
    {
        qRegisterMetaType<Climate::Setting>("Climate::Setting");
        qRegisterMetaType<Climate::Zone>("Climate::Zone");
    }

    void init()
    {
        m_log.emplace();
        m_vehicle = std::make_unique<BridgeTester>();
        QVERIFY(BridgeTester::setState("GlobalSource", {{"outsideTemperature", 21.5}}));
        m_climate = std::make_unique<Climate>(nullptr);
    }

    void cleanup()
    {
        m_climate.reset();
        m_vehicle.reset();
        m_log.reset();
    }

    void thePassengerFollowsUntilItHasAWishOfItsOwn()
    {
        m_climate->stepTemperature(Climate::Driver, 3);
        QCOMPARE(m_climate->driverTemperature(), QStringLiteral("23.0"));
        QCOMPARE(m_climate->passengerTemperature(), QStringLiteral("23.0"));
        m_climate->stepTemperature(Climate::Passenger, -1);
        QVERIFY(!m_climate->isSynchronous());
        m_climate->stepTemperature(Climate::Driver, 1);
        QCOMPARE(m_climate->passengerTemperature(), QStringLiteral("22.5"));
        m_climate->setSynchronous(true);
        QCOMPARE(m_climate->passengerTemperature(), QStringLiteral("23.5"));
    }

    void temperaturesHaveLimits()
    {
        m_climate->stepTemperature(Climate::Driver, 1000);
        QCOMPARE(m_climate->temperature(Climate::Driver), Climate::highest);
        QSignalSpy altered(m_climate.get(), &Climate::altered);
        m_climate->stepTemperature(Climate::Driver, 1);
        QCOMPARE(altered.size(), 0);
        m_climate->setTemperature(Climate::Driver, -300);
        QCOMPARE(m_climate->temperature(Climate::Driver), Climate::lowest);
    }

    void theAutomaticLooksAtTheWeather_data()
    {
        QTest::addColumn<double>("outside");
        QTest::addColumn<int>("fan");
        QTest::addColumn<int>("air");
        QTest::newRow("as it should be inside") << 21.5 << 1 << int(Climate::Face);
        QTest::newRow("hot") << 36.0 << 4 << int(Climate::Face);
        QTest::newRow("cold") << 5.0 << 5 << int(Climate::Windscreen | Climate::Feet);
        QTest::newRow("as cold as it gets") << -60.0 << 6 << int(Climate::Windscreen | Climate::Feet);
    }

    void theAutomaticLooksAtTheWeather()
    {
        QFETCH(double, outside);
        QVERIFY(BridgeTester::setState("GlobalSource", {{"outsideTemperature", outside}}));
        QTEST(m_climate->fan(), "fan");
        QTEST(m_climate->air(), "air");
    }

    void whoSetsTheFanEndsTheAutomatic()
    {
        m_climate->setFan(5);
        QVERIFY(!m_climate->isAutomatic());
        QVERIFY(BridgeTester::setState("GlobalSource", {{"outsideTemperature", 40}}));
        QCOMPARE(m_climate->fan(), 5);
        m_climate->setFan(99);
        QCOMPARE(m_climate->fan(), Climate::highestFanStep);
        m_climate->setFan(-1);
        QCOMPARE(m_climate->fan(), 1);
        m_climate->setAutomatic(true);
        QCOMPARE(m_climate->fan(), 5);
    }

    void theLastDirectionOfTheAirStays()
    {
        m_climate->toggleAir(Climate::Face);
        QCOMPARE(m_climate->air(), int(Climate::Face));
        m_climate->toggleAir(Climate::Feet);
        QCOMPARE(m_climate->air(), int(Climate::Face | Climate::Feet));
        QVERIFY(!m_climate->isAutomatic());
        m_climate->toggleAir(Climate::Face);
        QCOMPARE(m_climate->air(), int(Climate::Feet));
    }

    void defrostingLeavesEverythingAsItWas()
    {
        m_climate->setFan(2);
        m_climate->setCooling(false);
        m_climate->setRecirculating(true);
        m_climate->setDefrosting(true);
        QCOMPARE(m_climate->fan(), Climate::highestFanStep);
        QCOMPARE(m_climate->air(), int(Climate::Windscreen));
        QVERIFY(m_climate->isCooling() && !m_climate->isRecirculating());
        m_climate->setDefrosting(false);
        QCOMPARE(m_climate->fan(), 2);
        QVERIFY(!m_climate->isCooling() && m_climate->isRecirculating());
    }

    void defrostingEndsWithAWishForOtherAir()
    {
        m_climate->setDefrosting(true);
        m_climate->setRecirculating(true);
        QVERIFY(!m_climate->isDefrosting() && m_climate->isRecirculating());
        m_climate->setDefrosting(true);
        m_climate->setOn(false);
        QVERIFY(!m_climate->isDefrosting() && !m_climate->isOn());
    }

    void whatIsAskedForSwitchesOn()
    {
        m_climate->setOn(false);
        m_climate->setFan(3);
        QVERIFY(m_climate->isOn());
        m_climate->setOn(false);
        m_climate->setAutomatic(true);
        QVERIFY(m_climate->isOn() && m_climate->isAutomatic());
        m_climate->setOn(false);
        m_climate->setDefrosting(true);
        QVERIFY(m_climate->isOn());
    }

    void seatsHaveThreeSteps()
    {
        QList<int> steps;
        for (int i = 0; i < 5; ++i) {
            steps.append(m_climate->driverSeat());
            m_climate->stepSeat(Climate::Driver);
        }
        QCOMPARE(steps, QList<int>({0, 1, 2, 3, 0}));
        QCOMPARE(m_climate->passengerSeat(), 0);
    }

    void whatWasChangedIsTold()
    {
        QSignalSpy altered(m_climate.get(), &Climate::altered);
        m_climate->stepTemperature(Climate::Passenger, 1);
        m_climate->setRearDefrosting(true);
        m_climate->setRearDefrosting(true);
        QCOMPARE(altered.size(), 2);
        QCOMPARE(altered.at(0).at(0).value<Climate::Setting>(), Climate::Temperature);
        QCOMPARE(altered.at(0).at(1).value<Climate::Zone>(), Climate::Passenger);
        QCOMPARE(altered.at(1).at(0).value<Climate::Setting>(), Climate::RearDefrost);
    }
};

QTEST_GUILESS_MAIN(ClimateTest)
#include "tst_climate.moc"
