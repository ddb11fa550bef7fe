// SPDX-License-Identifier: MIT
#include "calltable.h"
#include "vehiclefixture.h"

/// The whole of the vehicle: every call and state of the table, and how lines leave.
class VehicleTest : public VehicleFixture
{
    Q_OBJECT

private Q_SLOTS:
    void everyStateOfTheTableHasAValue()
    {
        const CallTable& table = CallTable::instance();
        QVERIFY(table.sources().size() > 10);
        const QStringList sources = table.sources();
        for (const QString& source : sources) {
            QStringList expected = table.stateOf(source);
            expected.sort();
            QStringList fields = m_vehicle->state(source).keys();
            fields.sort();
            QCOMPARE(fields, expected);
        }
    }

    void everyCallOfTheTableIsAnswered()
    {
        const CallTable& table = CallTable::instance();
        int calls = 0;
        const QStringList sources = table.sources();
        for (const QString& source : sources) {
            const QStringList names = table.callsOf(source);
            for (const QString& name : names) {
                QVERIFY2(m_vehicle->answers(source, name), qPrintable(source + QLatin1Char('.') + name));
                ++calls;
            }
        }
        QVERIFY(calls > 90);
    }

    void sameCallsGiveTheSameLines()
    {
        QList<QPair<Channel, QByteArray>> runs[2];
        for (auto& run : runs) {
            make();
            call("GlobalSource", "sendShortSeekUp");
            m_vehicle->advance(1000);
            call("PhoneSource", "dial", {QStringLiteral("+1 555 0100")});
            for (int i = 0; i < 20; ++i)
                m_vehicle->advance(500);
            run = m_sent;
        }
        QVERIFY(runs[0].size() > 5);
        QCOMPARE(runs[0], runs[1]);
    }

    void badCallsAreRefused_data()
    {
        QTest::addColumn<QByteArray>("line");
        QTest::addColumn<QString>("problem");
        const auto row = [](const char* line, const char* problem) {
            QTest::newRow(line) << QByteArray(line) << QString::fromLatin1(problem);
        };
        row("garbage", "not a call");
        row("[]", "not a call");
        row("{\"source\":\"GlobalSource\",\"call\":\"setVolume\"}", "not a call");
        row("{\"source\":\"GlobalSource\",\"call\":\"setVolume\",\"args\":1}", "not a call");
        row("{\"source\":\"GlobalSource\",\"call\":\"setVolume\",\"args\":[1,2]}",
            "GlobalSource.setVolume: 2 arguments instead of 1");
        row("{\"source\":\"GlobalSource\",\"call\":\"setVolume\",\"args\":[\"1\"]}",
            "GlobalSource.setVolume: argument 1 is of another type");
        row("{\"source\":\"GlobalSource\",\"call\":\"setVolume\",\"args\":[1.5]}",
            "GlobalSource.setVolume: argument 1 is of another type");
        row("{\"source\":\"GlobalSource\",\"call\":\"setVolume\",\"args\":[1e300]}",
            "GlobalSource.setVolume: argument 1 is of another type");
        row("{\"source\":\"GlobalSource\",\"call\":\"explode\",\"args\":[]}", "GlobalSource.explode: no such call");
        row("{\"source\":\"TunerSource\",\"call\":\"tune\",\"args\":[\"\",\"\"]}", "TunerSource.tune: no such source");
        row("{\"source\":\"TouchInput\",\"call\":\"setPassThroughViewVisible\",\"args\":[true]}",
            "TouchInput has no calls on messages");
    }

    void badCallsAreRefused()
    {
        QFETCH(QByteArray, line);
        QTEST(m_vehicle->receive(Channel::Messages, line), "problem");
        QVERIFY(m_sent.isEmpty());
        QVERIFY(!m_vehicle->receive(Channel::Priority, line).isEmpty());
    }

    /// Every field at the ends of its range, then everything that the vehicle does about it.
    void anySwitchCanBeSetWithoutHarm()
    {
        const QJsonArray values{true,
                                false,
                                0,
                                1,
                                -1,
                                2,
                                7,
                                12,
                                34,
                                99,
                                1000000,
                                2147483647,
                                -2147483647 - 1,
                                0.5,
                                60.0,
                                QString(),
                                QStringLiteral("x"),
                                QStringLiteral("98.5"),
                                QJsonArray()};
        const CallTable& table = CallTable::instance();
        const QStringList sources = table.sources();
        int done = 0;
        for (const QString& source : sources) {
            const QStringList fields = table.stateOf(source);
            for (const QString& field : fields) {
                for (const QJsonValue tried : values) {
                    done += m_vehicle->setState(source, field, tried);
                    for (const char* const answer :
                         {"sendShortSeekUp", "sendLongSeekDown", "sendPressedTuneUpKey", "sendLongReleasedSeekDown"})
                        call("GlobalSource", answer);
                    call("GlobalSource", "sendShortPresetKey", {6});
                    call("GlobalSource", "sendLongPresetKey", {6});
                    m_vehicle->advance(1000);
                    QVERIFY(table.checkState(source, field, m_vehicle->state(source).value(field)).isEmpty());
                }
            }
        }
        QVERIFY(done > 200);
        call("GlobalSource", "setVolume", {-2147483647 - 1});
        QCOMPARE(number("GlobalSource", "volume"), 0);
        call("GlobalSource", "setVolume", {2147483647});
        QCOMPARE(number("GlobalSource", "volume"), 40);
    }

    void onlyWhatChangedIsSent()
    {
        call("GlobalSource", "sendShortReleasedVolumeUpKey");
        QCOMPARE(m_sent.size(), 1);
        QCOMPARE(m_sent.constFirst().second, QByteArray("{\"source\":\"GlobalSource\",\"state\":{\"volume\":13}}\n"));
        call("GlobalSource", "setVolume", {13});
        QCOMPARE(m_sent.size(), 1);
    }

    void frozenVehicleAnswersAtOnceAndStandsStill()
    {
        make(true);
        call("GlobalSource", "sendShortSeekUp");
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Klassik Atrium"));
        QCOMPARE(value("FMTunerSource", "seeking"), QJsonValue(false));
        call("GlobalSource", "setAudioSource", {16, -1});
        const QByteArray before = m_vehicle->snapshot();
        m_vehicle->advance(3600 * 1000);
        QCOMPARE(m_vehicle->snapshot(), before);
        QCOMPARE(textOf("GlobalSource", "clockText"), QStringLiteral("10:42"));
    }

    void clockGoesOn()
    {
        m_vehicle->advance(20 * 60 * 1000);
        QCOMPARE(textOf("GlobalSource", "clockText"), QStringLiteral("11:02"));
    }

    void keysLeaveOnTheirOwnChannel()
    {
        m_vehicle->keyEvent(7, 0);
        QCOMPARE(m_sent.size(), 1);
        QVERIFY(m_sent.constFirst().first == Channel::Priority);
        QCOMPARE(m_sent.constFirst().second,
                 QByteArray("{\"args\":[7,0],\"event\":\"keyEvent\",\"source\":\"KeySource\"}\n"));
    }

    void switchesSetAnyStateThatThereIs()
    {
        QVERIFY(m_vehicle->setState(QStringLiteral("GlobalSource"), QStringLiteral("nightMode"), true));
        QCOMPARE(value("GlobalSource", "nightMode"), QJsonValue(true));
        QVERIFY(m_vehicle->setState(QStringLiteral("GlobalSource"), QStringLiteral("mainAudioSource"), 16));
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(true));
        QVERIFY(m_vehicle->setState(QStringLiteral("GlobalSource"), QStringLiteral("mainAudioSource"), 5));
        call("GlobalSource", "sendShortSeekUp"); // a source without a model
        QVERIFY(!m_vehicle->setState(QStringLiteral("GlobalSource"), QStringLiteral("mainAudioSource"), 34));
        QVERIFY(!m_vehicle->setState(QStringLiteral("GlobalSource"), QStringLiteral("volume"), 41));
        QVERIFY(
            !m_vehicle->setState(QStringLiteral("FMTunerSource"), QStringLiteral("frequency"), QStringLiteral("5")));
        QVERIFY(!m_vehicle->setState(QStringLiteral("GlobalSource"), QStringLiteral("wings"), true));
        QVERIFY(!m_vehicle->setState(QStringLiteral("BoatSource"), QStringLiteral("nightMode"), true));
    }
};

QTEST_GUILESS_MAIN(VehicleTest)
#include "tst_vehicle.moc"
