// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "navigator.h"

#include <AL2HMIBridge/BridgeTester>

#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

using AL2HMIBridge::BridgeTester;

/// Guidance and the demonstration on one street that turns right once.
class NavigatorTest : public QObject
{
    Q_OBJECT

    static std::shared_ptr<const Town> corner()
    {
        auto town = std::make_shared<Town>();
        town->name = QStringLiteral("Corner");
        town->streets.append(
            {QStringLiteral("First"), StreetClass::Main, QVector<QPointF>{QPointF(0, 0), QPointF(1400, 0)}});
        town->streets.append(
            {QStringLiteral("Second"), StreetClass::Minor, QVector<QPointF>{QPointF(1400, 0), QPointF(1400, 800)}});
        town->places = {{QStringLiteral("Far Café"), QStringLiteral("food"), {1400, 800}},
                        {QStringLiteral("Near Fuel"), QStringLiteral("fuel"), {200, 5}},
                        {QStringLiteral("Far Fuel"), QStringLiteral("fuel"), {1390, 300}}};
        town->bounds = {0, 0, 1400, 800};
        return town;
    }

    static QStringList names(const DestinationModel& places)
    {
        QStringList list;
        for (int row = 0; row < places.rowCount(); ++row)
            list.append(places.index(row).data(DestinationModel::Name).toString());
        return list;
    }

    std::optional<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;
    std::unique_ptr<Navigator> m_navigator;

private Q_SLOTS:
    void init()
    {
        m_log.emplace();
        m_vehicle = std::make_unique<BridgeTester>();
        m_navigator = std::make_unique<Navigator>(corner(), nullptr);
    }

    void cleanup()
    {
        m_navigator.reset();
        m_vehicle.reset();
        m_log.reset();
    }

    void standsStillUntilTheDemonstrationIsStarted()
    {
        QCOMPARE(m_navigator->position(), QPointF(0, 0));
        QVERIFY(!m_navigator->isActive());
        m_navigator->setDriving(true);
        QVERIFY(!m_navigator->isDriving());
        m_navigator->advance(1);
        QCOMPARE(m_navigator->position(), QPointF(0, 0));
        QVERIFY(m_navigator->navigateTo(0));
        QVERIFY(!m_navigator->isDriving());
    }

    void tellsTheNextTurnAndTheWay()
    {
        QVERIFY(BridgeTester::setState("GlobalSource", {{"clockText", QStringLiteral("23:59")}}));
        QVERIFY(m_navigator->navigateTo(0));
        QCOMPARE(m_navigator->destination(), QStringLiteral("Far Café"));
        QCOMPARE(m_navigator->turnIcon(), QStringLiteral("turn-right"));
        QCOMPARE(m_navigator->turnStreet(), QStringLiteral("Second"));
        QCOMPARE(m_navigator->turnDistance(), QStringLiteral("1.4 km"));
        QCOMPARE(m_navigator->remaining(), QStringLiteral("2.2 km"));
        QCOMPARE(m_navigator->remainingTime(), QStringLiteral("3 min")); // 100 s at 14 m/s and 100 s at 8 m/s
        QCOMPARE(m_navigator->arrival(), QStringLiteral("00:02"));
        QCOMPARE(m_navigator->steps()->rowCount(), 2);
    }

    void drivesAlongTheRouteAndArrives()
    {
        QVERIFY(m_navigator->navigateTo(0));
        QSignalSpy arrived(m_navigator.get(), &Navigator::arrived);
        m_navigator->advance(10); // at three times 14 m/s
        QCOMPARE(m_navigator->position(), QPointF(420, 0));
        QCOMPARE(m_navigator->heading(), 90.0);
        QCOMPARE(m_navigator->turnDistance(), QStringLiteral("1.0 km"));
        m_navigator->advance(23);
        QCOMPARE(m_navigator->turnDistance(), QStringLiteral("10 m"));
        m_navigator->advance(1);
        QCOMPARE(m_navigator->heading(), 180.0);
        QCOMPARE(m_navigator->turnIcon(), QStringLiteral("destination"));
        QCOMPARE(m_navigator->turnStreet(), QStringLiteral("Far Café"));
        QCOMPARE(m_navigator->steps()->rowCount(), 1);
        QCOMPARE(arrived.size(), 0);
        m_navigator->advance(1000);
        QCOMPARE(arrived.size(), 1);
        QCOMPARE(m_navigator->position(), QPointF(1400, 800));
        QVERIFY(!m_navigator->isActive());
        QCOMPARE(m_navigator->turnIcon(), QString());
    }

    void theDemonstrationRunsByItself()
    {
        QVERIFY(m_navigator->navigateTo(0));
        QSignalSpy moved(m_navigator.get(), &Navigator::moved);
        m_navigator->setDriving(true);
        QTRY_VERIFY(m_navigator->position().x() > 0);
        QVERIFY(!moved.isEmpty());
        m_navigator->stop();
        QVERIFY(!m_navigator->isDriving());
    }

    void placesAreFoundByTheirNames_data()
    {
        QTest::addColumn<QString>("words");
        QTest::addColumn<int>("place");
        QTest::newRow("whole") << QStringLiteral("Far Fuel") << 2;
        QTest::newRow("in any case") << QStringLiteral(" far CAFÉ ") << 0;
        QTest::newRow("start") << QStringLiteral("near") << 1;
        QTest::newRow("first of several") << QStringLiteral("Far") << 0;
        QTest::newRow("unknown") << QStringLiteral("Nowhere") << -1;
        QTest::newRow("nothing") << QString() << -1;
    }

    void placesAreFoundByTheirNames()
    {
        QFETCH(QString, words);
        QTEST(m_navigator->findPlace(words), "place");
        QVERIFY(!m_navigator->navigateTo(-1) && !m_navigator->navigateTo(3));
    }

    void theNearestPlaceComesFirst()
    {
        DestinationModel& places = *m_navigator->destinations();
        QCOMPARE(names(places),
                 QStringList({QStringLiteral("Near Fuel"), QStringLiteral("Far Fuel"), QStringLiteral("Far Café")}));
        places.setCategory(3); // fuel
        QCOMPARE(names(places), QStringList({QStringLiteral("Near Fuel"), QStringLiteral("Far Fuel")}));
        QCOMPARE(places.index(0).data(DestinationModel::Distance).toString(), QStringLiteral("200 m"));
        places.setPosition({1400, 300});
        QCOMPARE(names(places).constFirst(), QStringLiteral("Far Fuel"));
        places.setCategory(99);
        QCOMPARE(places.category(), 3);
    }

    void aRouteIsFoundAnewWhenMotorwaysAreToBeAvoided()
    {
        QVERIFY(m_navigator->navigateTo(0));
        m_navigator->advance(10);
        QSignalSpy routes(m_navigator.get(), &Navigator::routeChanged);
        m_navigator->setAvoidMotorways(true);
        m_navigator->setAvoidMotorways(true);
        QCOMPARE(routes.size(), 1);
        QCOMPARE(m_navigator->remaining(), QStringLiteral("1.8 km")); // from where the vehicle is
    }

    void aTownWithoutStreetsLeadsNowhere()
    {
        Navigator lost(std::make_shared<const Town>(), nullptr);
        QVERIFY(!lost.navigateTo(0));
        QVERIFY(!lost.isActive());
    }
};

QTEST_GUILESS_MAIN(NavigatorTest)
#include "tst_navigator.moc"
