// SPDX-License-Identifier: MIT
#include "streetgraph.h"

#include <QTest>

#include <numeric>

/// A cross of two streets, a motorway around it, and a street that joins nothing:
///
///     (0,0)──── North ────(1000,0)
///       │                    │
///      West               Motorway
///       │                    │
///     (0,1000)── South ──(1000,1000)
class StreetGraphTest : public QObject
{
    Q_OBJECT

    static Town square()
    {
        Town town;
        const auto street = [&](const char* name, StreetClass kind, const QPolygonF& points) {
            town.streets.append({QString::fromLatin1(name), kind, points});
        };
        street("North", StreetClass::Minor, QVector<QPointF>{QPointF(0, 0), QPointF(500, 0), QPointF(1000, 0)});
        street("West", StreetClass::Minor, QVector<QPointF>{QPointF(0, 0), QPointF(0, 1000)});
        street("South", StreetClass::Minor, QVector<QPointF>{QPointF(0, 1000), QPointF(1000, 1000)});
        street("Motorway", StreetClass::Motorway, QVector<QPointF>{QPointF(1000, 0), QPointF(1000, 1000)});
        street("Island", StreetClass::Minor, QVector<QPointF>{QPointF(5000, 0), QPointF(6000, 0)});
        return town;
    }

    static QStringList words(const Route& route)
    {
        static const char* const names[] = {"depart", "straight",   "slight left", "slight right", "left",
                                            "right",  "sharp left", "sharp right", "round",        "arrive"};
        QStringList list;
        for (const RouteStep& step : route.steps)
            list.append(QStringLiteral("%1 %2 %3")
                            .arg(QLatin1String(names[int(step.manoeuvre)]), step.street)
                            .arg(step.at)
                            .simplified());
        return list;
    }

private Q_SLOTS:
    void theFastestWayIsNotTheShortest()
    {
        const StreetGraph graph(square());
        const Route route = graph.route({600, 10}, {900, 990}, false);
        QCOMPARE(words(route), QStringList({QStringLiteral("depart North 0"), QStringLiteral("right Motorway 400"),
                                            QStringLiteral("right South 1400"), QStringLiteral("arrive 1500")}));
        QCOMPARE(route.length(), 1500.0);
        QCOMPARE(route.secondsFrom(0), 400 / 8.0 + 1000 / 28.0 + 100 / 8.0);
    }

    void motorwaysCanBeAvoided()
    {
        const StreetGraph graph(square());
        QCOMPARE(words(graph.route({600, 10}, {900, 990}, true)),
                 QStringList({QStringLiteral("depart North 0"), QStringLiteral("left West 600"),
                              QStringLiteral("left South 1600"), QStringLiteral("arrive 2500")}));
    }

    void whereNoStreetLeadsThereIsNoRoute()
    {
        const StreetGraph graph(square());
        QVERIFY(graph.route({0, 0}, {5500, 0}, false).isEmpty());
        QVERIFY(StreetGraph(Town()).route({0, 0}, {1, 1}, false).isEmpty());
    }

    void onOneStretchNothingIsTurned()
    {
        const StreetGraph graph(square());
        const Route route = graph.route({100, 0}, {300, 20}, false);
        QCOMPARE(words(route), QStringList({QStringLiteral("depart North 0"), QStringLiteral("arrive 200")}));
        QCOMPARE(route.headingAt(50), 90.0);
        QCOMPARE(graph.route({300, 0}, {100, 0}, false).headingAt(50), 270.0);
    }

    void aRouteMayBeginAndEndOnACorner()
    {
        const StreetGraph graph(square());
        const Route route = graph.route({0, 0}, {0, 1000}, false);
        QCOMPARE(route.length(), 1000.0);
        QCOMPARE(route.points.constFirst(), QPointF(0, 0));
        QCOMPARE(route.points.constLast(), QPointF(0, 1000));
        QCOMPARE(route.legs.size(), route.points.size() - 1);
    }

    void aRouteKnowsItsPoints()
    {
        const Route route = StreetGraph(square()).route({600, 0}, {900, 1000}, false);
        QCOMPARE(route.pointAt(0), QPointF(600, 0));
        QCOMPARE(route.pointAt(900), QPointF(1000, 500));
        QCOMPARE(route.pointAt(99999), QPointF(900, 1000));
        QCOMPARE(route.headingAt(900), 180.0);
        QCOMPARE(route.secondsFrom(1500), 0.0);
    }

    void turnsHaveNames_data()
    {
        QTest::addColumn<double>("degrees");
        QTest::addColumn<int>("manoeuvre");
        const auto row = [](double degrees, Manoeuvre manoeuvre) {
            QTest::addRow("%g", degrees) << degrees << int(manoeuvre);
        };
        row(0, Manoeuvre::Straight);
        row(-19, Manoeuvre::Straight);
        row(20, Manoeuvre::SlightRight);
        row(-40, Manoeuvre::SlightLeft);
        row(90, Manoeuvre::Right);
        row(-90, Manoeuvre::Left);
        row(130, Manoeuvre::SharpRight);
        row(-130, Manoeuvre::SharpLeft);
        row(180, Manoeuvre::TurnRound);
        row(-170, Manoeuvre::TurnRound);
    }

    void turnsHaveNames()
    {
        QFETCH(double, degrees);
        QTEST(int(turnOf(degrees)), "manoeuvre");
    }

    /// Whatever the two places of the head unit's own town are, one can drive from one to the other.
    void everyPlaceOfTheTownCanBeReached()
    {
        QString error;
        const auto town = Town::load(QStringLiteral(TOWN_FILE), &error);
        QVERIFY2(town, qPrintable(error));
        const StreetGraph graph(*town);
        for (const Place& from : town->places)
            for (const Place& to : town->places)
                if (&from != &to)
                    for (const bool avoid : {false, true}) {
                        const Route route = graph.route(from.at, to.at, avoid);
                        QVERIFY2(!route.isEmpty(), qPrintable(from.name + QStringLiteral(" to ") + to.name));
                        QCOMPARE(route.legs.size(), route.points.size() - 1);
                        for (const auto& leg : route.legs)
                            QVERIFY(!avoid || leg.street != QLatin1String("Coast Motorway"));
                    }
    }
};

QTEST_GUILESS_MAIN(StreetGraphTest)
#include "tst_streetgraph.moc"
