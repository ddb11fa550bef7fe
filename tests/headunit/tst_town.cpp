// SPDX-License-Identifier: MIT
#include "scratchfile.h"
#include "town.h"

#include <QTest>

class TownTest : public QObject
{
    Q_OBJECT

    const ScratchFile m_file{QStringLiteral("town.json")};

private Q_SLOTS:
    void theTownOfTheHeadUnitIsWhole()
    {
        QString error;
        const auto town = Town::load(QStringLiteral(TOWN_FILE), &error);
        QVERIFY2(town, qPrintable(error));
        QVERIFY(town->streets.size() >= 50);
        QVERIFY(town->places.size() >= 20);
        QVERIFY(town->bounds.contains(town->start));
        for (const Place& place : town->places)
            QVERIFY2(town->bounds.contains(place.at) && !place.name.isEmpty(), qPrintable(place.name));
    }

    void whatIsReadIsWhatIsWritten()
    {
        QString error;
        const auto town = Town::load(m_file.with(R"({"name": "Town", "start": {"at": [1, 2], "heading": 90},
            "areas": [{"kind": "park", "name": "Park", "points": [[0, 0], [1, 0], [1, 1]]}],
            "streets": [{"name": "A", "class": "main", "points": [[0, 0], [10, 0], [10, 5]]}],
            "places": [{"name": "P", "category": "fuel", "at": [3, 4]}]})"),
                                     &error);
        QVERIFY2(town, qPrintable(error));
        QCOMPARE(town->name, QStringLiteral("Town"));
        QCOMPARE(town->start, QPointF(1, 2));
        QCOMPARE(town->heading, 90.0);
        QCOMPARE(int(town->areas.constFirst().kind), int(AreaKind::Park));
        QCOMPARE(int(town->streets.constFirst().kind), int(StreetClass::Main));
        QCOMPARE(town->streets.constFirst().points.at(2), QPointF(10, 5));
        QCOMPARE(town->places.constFirst().category, QStringLiteral("fuel"));
        QCOMPARE(town->bounds, QRectF(0, 0, 10, 5));
    }

    void whatIsWrongIsNamed_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("message");
        const auto row = [](const char* name, const char* content, const char* message) {
            QTest::newRow(name) << QByteArray(content) << QString::fromLatin1(message);
        };
        const char* const start = R"("start": {"at": [0, 0]})";
        const auto streets = [&](const char* street) {
            return QByteArray("{") + start + ", \"streets\": [" + street + "]}";
        };
        row("no JSON", "{", "at byte 1");
        row("no streets", R"({"start": {"at": [0, 0]}})", "streets: there are none");
        row("no start", R"({"streets": [{"class": "main", "points": [[0, 0], [1, 1]]}]})",
            "start.at: is no pair of metres");
        row("unknown class", streets(R"({"class": "path", "points": [[0, 0], [1, 1]]})").constData(),
            "streets[0].class: 'path' is not known");
        row("a single point", streets(R"({"class": "main", "points": [[0, 0]]})").constData(),
            "streets[0].points: has fewer than 2");
        row("half a point", streets(R"({"class": "main", "points": [[0, 0], [1]]})").constData(),
            "streets[0].points[1]: is no pair of metres");
        row("a point of texts", streets(R"({"class": "main", "points": [["0", "0"], [1, 1]]})").constData(),
            "streets[0].points[0]: is no pair of metres");
        row("a point beyond whole numbers", streets(R"({"class": "main", "points": [[0, 0], [1, 1e36]]})").constData(),
            "streets[0].points[1]: is too far away");
        row("a start beyond all bounds", R"({"start": {"at": [-10000001, 0]}, "streets": []})",
            "start.at: is too far away");
    }

    void whatIsWrongIsNamed()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, message);
        QString error;
        QVERIFY(!Town::load(m_file.with(content), &error));
        QVERIFY2(error.contains(message) && error.contains(QLatin1String("town.json")), qPrintable(error));
    }

    void aFileThatIsNotThereIsNamed()
    {
        QString error;
        QVERIFY(!Town::load(m_file.folder() + QStringLiteral("/none.json"), &error));
        QVERIFY2(error.contains(QLatin1String("none.json")), qPrintable(error));
    }
};

QTEST_GUILESS_MAIN(TownTest)
#include "tst_town.moc"
