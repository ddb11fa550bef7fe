// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "units.h"

#include <AL2HMIBridge/BridgeTester>
#include <HmiCore/HmiMarketPropertyStore>

#include <QLocale>
#include <QTest>

#include <memory>
#include <optional>

using AL2HMIBridge::BridgeTester;

/// Quantities as the markets of the head unit and its languages write them.
class UnitsTest : public QObject
{
    Q_OBJECT

    std::optional<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log.emplace();
        m_vehicle = std::make_unique<BridgeTester>();
        HmiCore::HmiMarketPropertyStore::instance()->loadConfiguration(QStringLiteral(MARKETS),
                                                                       QStringLiteral("config.json"));
    }

    void cleanup()
    {
        QLocale::setDefault(QLocale::c());
        m_vehicle.reset();
        m_log.reset();
    }

    void distancesAreRoundedAsOneSaysThem_data()
    {
        QTest::addColumn<int>("country");
        QTest::addColumn<double>("metres");
        QTest::addColumn<QString>("text");
        const auto row = [](int country, double metres, const char* text) {
            QTest::addRow("%x %g", country, metres) << country << metres << QString::fromLatin1(text);
        };
        const int germany = 0x114;
        row(germany, -5, "0 m");
        row(germany, 4, "0 m");
        row(germany, 94, "90 m");
        row(germany, 130, "150 m");
        row(germany, 960, "950 m");
        row(germany, 980, "1.0 km");
        row(germany, 2345, "2.3 km");
        row(germany, 23456, "23 km");
        const int unitedKingdom = 0x33A;
        row(unitedKingdom, 100, "100 yd");
        row(unitedKingdom, 805, "0.5 mi");
        const int unitedStates = 0x348;
        row(unitedStates, 100, "350 ft");
        row(unitedStates, 1609, "1.0 mi");
    }

    void distancesAreRoundedAsOneSaysThem()
    {
        QFETCH(int, country);
        QFETCH(double, metres);
        QVERIFY(BridgeTester::setState("GlobalSource", {{"destinationCountry", country}}));
        QTEST(Units::distance(metres), "text");
        QCOMPARE(Units::isFahrenheit(), country == 0x348);
    }

    void timesAreAtLeastAMinute_data()
    {
        QTest::addColumn<double>("seconds");
        QTest::addColumn<QString>("text");
        QTest::newRow("none") << 0.0 << QStringLiteral("1 min");
        QTest::newRow("a minute and a half") << 90.0 << QStringLiteral("2 min");
        QTest::newRow("an hour") << 3600.0 << QStringLiteral("1 h 0 min");
        QTest::newRow("longer") << 7500.0 << QStringLiteral("2 h 5 min");
    }

    void timesAreAtLeastAMinute()
    {
        QFETCH(double, seconds);
        QTEST(Units::duration(seconds), "text");
    }

    void pointsAreThoseOfTheLanguage_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::addColumn<QString>("text");
        QTest::newRow("English") << QStringLiteral("en_US") << QStringLiteral("21.5");
        QTest::newRow("German") << QStringLiteral("de_DE") << QStringLiteral("21,5");
        QTest::newRow("French") << QStringLiteral("fr_FR") << QStringLiteral("21,5");
        QTest::newRow("Arabic, with European digits") << QStringLiteral("ar_SA") << QStringLiteral("21.5");
    }

    void pointsAreThoseOfTheLanguage()
    {
        QFETCH(QString, locale);
        QLocale::setDefault(QLocale(locale));
        QTEST(Units::number(21.49, 1), "text");
    }
};

QTEST_GUILESS_MAIN(UnitsTest)
#include "tst_units.moc"
