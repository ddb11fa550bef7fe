// SPDX-License-Identifier: MIT
#include "vehiclefixture.h"

/// Stations: seeking, tuning, presets, announcements, digital signals and the satellite tuner's replay buffer.
class TunersTest : public VehicleFixture
{
    Q_OBJECT

private Q_SLOTS:
    void seekFindsTheNextStationAfterAMoment()
    {
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Radio Meridian"));
        QCOMPARE(call("GlobalSource", "sendShortSeekUp"), QString());
        QCOMPARE(value("FMTunerSource", "seeking"), QJsonValue(true));
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Radio Meridian"));
        m_vehicle->advance(500);
        QCOMPARE(value("FMTunerSource", "seeking"), QJsonValue(false));
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Klassik Atrium"));
        QCOMPARE(textOf("FMTunerSource", "frequency"), QStringLiteral("91.3"));
    }

    void seekRoundsTheEndOfTheBand()
    {
        call("GlobalSource", "sendShortSeekDown");
        m_vehicle->advance(500);
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Radio Karavane"));
        call("GlobalSource", "sendShortSeekUp");
        m_vehicle->advance(500);
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Radio Meridian"));
    }

    void seekStartsFromAFrequencyWithoutAStation_data()
    {
        QTest::addColumn<QString>("call");
        QTest::addColumn<QString>("name");
        QTest::newRow("up") << QStringLiteral("sendShortSeekUp") << QStringLiteral("Nova Jazz");
        QTest::newRow("down") << QStringLiteral("sendShortSeekDown") << QStringLiteral("Klassik Atrium");
    }

    void seekStartsFromAFrequencyWithoutAStation()
    {
        QFETCH(QString, call);
        this->call("FMTunerSource", "tune", {QStringLiteral("92"), QStringLiteral("-1")});
        QCOMPARE(textOf("FMTunerSource", "frequency"), QStringLiteral("92.0"));
        QCOMPARE(textOf("FMTunerSource", "stationName"), QString());
        QCOMPARE(number("FMTunerSource", "activePreset"), 0);
        this->call("GlobalSource", call.toLatin1().constData());
        m_vehicle->advance(500);
        QTEST(textOf("FMTunerSource", "stationName"), "name");
    }

    void tuneRefusesWhatIsNotInTheBand_data()
    {
        QTest::addColumn<QString>("frequency");
        for (const char* const frequency : {"", "abc", "87.4", "108.1", "-5", "nan", "inf", "1e300"})
            QTest::newRow(frequency) << QString::fromLatin1(frequency);
    }

    void tuneRefusesWhatIsNotInTheBand()
    {
        QFETCH(QString, frequency);
        call("FMTunerSource", "tune", {frequency, QStringLiteral("-1")});
        QCOMPARE(textOf("FMTunerSource", "frequency"), QStringLiteral("88.7"));
    }

    void tuneStepsRoundTheBand()
    {
        call("FMTunerSource", "tune", {QStringLiteral("108.0"), QStringLiteral("-1")});
        call("GlobalSource", "sendPressedTuneUpKey");
        QCOMPARE(textOf("FMTunerSource", "frequency"), QStringLiteral("87.5"));
        call("GlobalSource", "sendPressedTuneDownKey");
        QCOMPARE(textOf("FMTunerSource", "frequency"), QStringLiteral("108.0"));
    }

    void aReservedKnobDoesNotTune()
    {
        const QString before = textOf("FMTunerSource", "frequency");
        call("GlobalSource", "reserveTuneKnob", {true});
        for (const char* const key : {"sendPressedTuneUpKey", "sendPressedTuneDownKey", "sendLongPressedTuneUpKey"})
            call("GlobalSource", key);
        QCOMPARE(textOf("FMTunerSource", "frequency"), before);
        call("GlobalSource", "sendShortPresetKey", {5}); // is another key
        QVERIFY(textOf("FMTunerSource", "frequency") != before);
        call("GlobalSource", "reserveTuneKnob", {false});
        const QString tuned = textOf("FMTunerSource", "frequency");
        call("GlobalSource", "sendPressedTuneUpKey");
        QVERIFY(textOf("FMTunerSource", "frequency") != tuned);
    }

    void presetsAreRecalledFromTheActiveBank()
    {
        call("FMTunerSource", "recallPreset", {1, 5});
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Harbour FM"));
        QCOMPARE(number("FMTunerSource", "activePreset"), 5);
        call("FMTunerSource", "selectPresetBank", {1});
        call("GlobalSource", "sendShortPresetKey", {2});
        QCOMPARE(number("FMTunerSource", "activePreset"), 8);
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Newsline 24"));
        for (const int wrong : {0, 7, -1, 2147483647})
            call("FMTunerSource", "recallPreset", {1, wrong});
        QCOMPARE(number("FMTunerSource", "activePreset"), 8);
    }

    void heldPresetKeyStores()
    {
        call("FMTunerSource", "tune", {QStringLiteral("107.2"), QString()});
        call("GlobalSource", "sendLongPresetKey", {1});
        call("FMTunerSource", "tune", {QStringLiteral("96.1"), QString()});
        call("GlobalSource", "sendShortPresetKey", {1});
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Radio Karavane"));
        QCOMPARE(value("FMTunerSource", "presets")
                     .toArray()
                     .first()
                     .toObject()
                     .value(QStringLiteral("frequency"))
                     .toString(),
                 QStringLiteral("107.2"));
    }

    void autoStoreFillsTheBankWithTheStrongest()
    {
        call("FMTunerSource", "startAutoStore");
        QCOMPARE(value("FMTunerSource", "autoStoreInProgress"), QJsonValue(true));
        m_vehicle->advance(3000);
        QCOMPARE(value("FMTunerSource", "autoStoreInProgress"), QJsonValue(false));
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("Harbour FM"));
        call("FMTunerSource", "startAutoStore");
        call("FMTunerSource", "sendAutoStoreCancel");
        QCOMPARE(value("FMTunerSource", "autoStoreInProgress"), QJsonValue(false));
    }

    void trafficAnnouncementsComeOnlyWhenWanted()
    {
        m_vehicle->startTrafficAnnouncement(QStringLiteral("Jam"));
        QCOMPARE(number("FMTunerSource", "announcementType"), 0);
        call("FMTunerSource", "recallPreset", {1, 2}); // a station without announcements
        call("FMTunerSource", "toggleTpSeekInProgress", {1, true});
        QCOMPARE(value("FMTunerSource", "tpSeekInProgress"), QJsonValue(true));
        m_vehicle->advance(500);
        QCOMPARE(textOf("FMTunerSource", "stationName"), QStringLiteral("City Beat"));
        m_vehicle->startTrafficAnnouncement(QStringLiteral("Jam"));
        QCOMPARE(number("FMTunerSource", "announcementType"), 1);
        call("FMTunerSource", "cancelAnnouncement", {1});
        QCOMPARE(number("FMTunerSource", "announcementType"), 0);
        m_vehicle->startTrafficAnnouncement(QStringLiteral("Jam"));
        m_vehicle->advance(20000);
        QCOMPARE(number("FMTunerSource", "announcementType"), 0);
    }

    void bankOfTheSatelliteTunerIsSelectedWithTheSource()
    {
        call("GlobalSource", "setAudioSource", {2, 1});
        QCOMPARE(number("XMTunerSource", "activePresetBank"), 1);
        call("GlobalSource", "setAudioSource", {2, 99});
        QCOMPARE(number("XMTunerSource", "activePresetBank"), 1);
    }

    void satelliteReplayStepsThroughTitles()
    {
        const QString live = textOf("XMTunerSource", "title");
        call("XMTunerSource", "seekReverseShort"); // to the beginning of the title
        QCOMPARE(number("XMTunerSource", "replayStatus"), 1);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 100);
        QCOMPARE(textOf("XMTunerSource", "title"), live);
        call("XMTunerSource", "seekReverseShort"); // to the one before it
        QCOMPARE(number("XMTunerSource", "replayOffset"), 300);
        QVERIFY(textOf("XMTunerSource", "title") != live);
        m_vehicle->advance(10000);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 300); // it plays on, as late as before
        call("XMTunerSource", "seekForwardShort");
        QCOMPARE(textOf("XMTunerSource", "title"), live);
        call("XMTunerSource", "goLive");
        QCOMPARE(textOf("XMTunerSource", "title"), live);
        QCOMPARE(number("XMTunerSource", "replayStatus"), 0);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 0);
    }

    void satelliteReplayWinds()
    {
        call("XMTunerSource", "seekReverseLong", {1});
        m_vehicle->advance(2000);
        call("XMTunerSource", "seekReverseLong", {0});
        QCOMPARE(number("XMTunerSource", "replayOffset"), 40);
        m_vehicle->advance(2000);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 40);
        call("XMTunerSource", "seekForwardLong", {1});
        m_vehicle->advance(60000);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 0);
        call("XMTunerSource", "seekReverseLong", {1});
        m_vehicle->peerLost();
        call("GlobalSource", "setAudioSource", {2, -1});
        m_vehicle->advance(600000);
        QVERIFY(number("XMTunerSource", "replayOffset") <= number("XMTunerSource", "replayLength"));
    }

    void satellitePauseKeepsWhatComes()
    {
        call("XMTunerSource", "togglePlayPause", {0});
        QCOMPARE(number("XMTunerSource", "playStatus"), 0);
        QCOMPARE(number("XMTunerSource", "replayStatus"), 1);
        m_vehicle->advance(30000);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 30);
        call("XMTunerSource", "togglePlayPause", {1});
        m_vehicle->advance(30000);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 30);
        call("XMTunerSource", "togglePlayPause", {0});
        m_vehicle->advance(3600 * 1000); // longer than is kept
        QCOMPARE(number("XMTunerSource", "playStatus"), 1);
        QCOMPARE(number("XMTunerSource", "replayOffset"), 1800);
        call("XMTunerSource", "tuneToStation", {2});
        QCOMPARE(number("XMTunerSource", "replayOffset"), 0);
    }

    void digitalSignalIsFoundLostAndFoundAgain()
    {
        QCOMPARE(number("FMTunerSource", "hdProgram"), 1);
        call("FMTunerSource", "recallPreset", {1, 5});
        QCOMPARE(value("FMTunerSource", "hdAvailable"), QJsonValue(true));
        QCOMPARE(number("FMTunerSource", "hdProgram"), 0);
        m_vehicle->advance(1500);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 1);
        m_vehicle->setDigitalReception(false);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 0);
        QCOMPARE(number("FMTunerSource", "hdSignalLossStatus"), 1);
        m_vehicle->setDigitalReception(true);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 1);
        QCOMPARE(number("FMTunerSource", "hdSignalLossStatus"), 0);
        call("FMTunerSource", "recallPreset", {1, 2}); // has none
        m_vehicle->advance(60000);
        QCOMPARE(value("FMTunerSource", "hdAvailable"), QJsonValue(false));
        m_vehicle->setDigitalReception(false);
        QCOMPARE(number("FMTunerSource", "hdSignalLossStatus"), 0);
    }

    void retuningToTheMainProgrammeStaysAnalogue()
    {
        m_vehicle->setDigitalReception(false);
        call("FMTunerSource", "tune", {QStringLiteral("88.7"), QStringLiteral("-1")});
        QCOMPARE(number("FMTunerSource", "hdSignalLossStatus"), 0);
        m_vehicle->advance(60000);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 0);
        call("FMTunerSource", "tune", {QStringLiteral("88.7"), QStringLiteral("2")});
        m_vehicle->advance(1500);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 2);
        call("FMTunerSource", "tune", {QStringLiteral("88.7"), QStringLiteral("-1")});
        call("GlobalSource", "sendShortSeekUp");
        m_vehicle->advance(500);
        call("GlobalSource", "sendShortSeekDown");
        m_vehicle->advance(3000);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 1);
    }

    void weakDigitalSignalComesAndGoes()
    {
        call("FMTunerSource", "tune", {QStringLiteral("102.9"), QString()});
        m_vehicle->advance(1500);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 1);
        m_vehicle->advance(8000);
        QCOMPARE(number("FMTunerSource", "hdSignalLossStatus"), 1);
        m_vehicle->advance(8000);
        QCOMPARE(number("FMTunerSource", "hdSignalLossStatus"), 0);
        QCOMPARE(number("FMTunerSource", "hdProgram"), 1);
    }

    void seekRunsThroughTheBand()
    {
        call("GlobalSource", "sendShortSeekUp");
        m_vehicle->advance(200);
        const double between = textOf("FMTunerSource", "frequency").toDouble();
        QVERIFY(between > 88.7 && between < 91.3);
        QCOMPARE(value("FMTunerSource", "seeking"), QJsonValue(true));
        call("GlobalSource", "sendShortSeekDown"); // changes its mind
        m_vehicle->advance(500);
        QCOMPARE(textOf("FMTunerSource", "frequency"), QStringLiteral("88.7"));
    }

    void autoStoreTellsHowFarItIs()
    {
        const QJsonValue before = value("AMTunerSource", "presets");
        call("AMTunerSource", "startAutoStore");
        m_vehicle->advance(1500);
        QCOMPARE(number("AMTunerSource", "autoStoreProgress"), 50);
        call("AMTunerSource", "sendAutoStoreCancel");
        QCOMPARE(number("AMTunerSource", "autoStoreProgress"), 0);
        m_vehicle->advance(60000);
        QCOMPARE(value("AMTunerSource", "presets"), before);
    }

    void announcementsInterruptOtherSources()
    {
        call("AMTunerSource", "toggleTpSeekInProgress", {0, true});
        call("GlobalSource", "setAudioSource", {16, -1});
        m_vehicle->startTrafficAnnouncement(QStringLiteral("Jam"), QStringLiteral("AM"));
        QCOMPARE(number("AMTunerSource", "announcementType"), 1);
        QCOMPARE(number("FMTunerSource", "announcementType"), 0);
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(false));
        QCOMPARE(number("GlobalSource", "mainAudioSource"), 16);
        m_vehicle->advance(20000);
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(true));
    }
};

QTEST_GUILESS_MAIN(TunersTest)
#include "tst_tuners.moc"
