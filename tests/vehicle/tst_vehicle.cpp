// SPDX-License-Identifier: MIT
#include "calltable.h"
#include "logcapture.h"

#include <HmiVehicle/vehicle.h>

#include <QJsonDocument>
#include <QTest>

#include <memory>

using namespace HmiVehicle;

/// What the vehicle does when it is called and when time passes; no sockets, no clock.
class VehicleTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<Vehicle> m_vehicle;
    QList<QPair<Channel, QByteArray>> m_sent;

    void make(bool frozen = false)
    {
        Vehicle::Options options;
        options.frozen = frozen;
        m_sent.clear();
        m_vehicle = std::make_unique<Vehicle>(options, [this](Channel channel, const QByteArray& line) {
            m_sent.append({channel, line});
        });
    }

    QString call(const char* source, const char* name, const QJsonArray& arguments = {},
                 Channel channel = Channel::Messages)
    {
        const QJsonObject line{{QStringLiteral("source"), QString::fromLatin1(source)},
                               {QStringLiteral("call"), QString::fromLatin1(name)},
                               {QStringLiteral("args"), arguments}};
        return m_vehicle->receive(channel, QJsonDocument(line).toJson(QJsonDocument::Compact));
    }

    QJsonValue value(const char* source, const char* field) const
    {
        return m_vehicle->state(QString::fromLatin1(source)).value(QLatin1String(field));
    }

    QString textOf(const char* source, const char* field) const { return value(source, field).toString(); }
    int number(const char* source, const char* field) const { return value(source, field).toInt(-999); }

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        make();
    }

    void cleanup()
    {
        m_vehicle.reset();
        m_log.reset();
    }

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

    void volumeKeyStepsAndRamps()
    {
        call("GlobalSource", "sendShortReleasedVolumeUpKey");
        QCOMPARE(number("GlobalSource", "volume"), 13);
        call("GlobalSource", "sendLongPressedVolumeUpKey");
        m_vehicle->advance(600);
        QCOMPARE(number("GlobalSource", "volume"), 18);
        call("GlobalSource", "sendLongReleasedVolumeUpKey");
        m_vehicle->advance(5000);
        QCOMPARE(number("GlobalSource", "volume"), 18);
        call("GlobalSource", "sendLongPressedVolumeDownKey");
        m_vehicle->advance(60000);
        QCOMPARE(number("GlobalSource", "volume"), 0);
    }

    void rampEndsWhenTheHmiIsGone()
    {
        call("GlobalSource", "sendLongPressedVolumeUpKey");
        m_vehicle->peerLost();
        m_vehicle->advance(60000);
        QCOMPARE(number("GlobalSource", "volume"), 12);
    }

    void volumeKeysChangeTheVoiceWhileItIsHeard()
    {
        call("GlobalSource", "sendPressedVoicePTTKey");
        call("GlobalSource", "sendShortReleasedVolumeUpKey");
        QCOMPARE(number("GlobalSource", "volume"), 12);
        QCOMPARE(number("GlobalSource", "voiceVolume"), 17);
        call("SpeechSource", "cancelVRSession");
        call("SpeechSource", "voiceRecognitionNotReadyError");
        call("GlobalSource", "sendShortReleasedVolumeDownKey");
        QCOMPARE(number("GlobalSource", "voiceVolume"), 16);
        call("SpeechSource", "cancelTTSSession");
        call("GlobalSource", "sendShortReleasedVolumeUpKey");
        QCOMPARE(number("GlobalSource", "volume"), 13);
    }

    void muteEndsWithTheNextVolumeStep()
    {
        call("GlobalSource", "sendShortReleasedMuteKey");
        QCOMPARE(value("GlobalSource", "muted"), QJsonValue(true));
        call("GlobalSource", "sendShortReleasedVolumeDownKey");
        QCOMPARE(value("GlobalSource", "muted"), QJsonValue(false));
    }

    void sourceKeyGoesRoundTheSources()
    {
        QList<int> seen;
        for (int i = 0; i < 6; ++i) {
            call("GlobalSource", "setAudioSource", {12, -1});
            seen.append(number("GlobalSource", "mainAudioSource"));
        }
        QCOMPARE(seen, QList<int>({2, 3, 4, 16, 0, 1}));
    }

    void cdWithoutADiscIsNotSelected()
    {
        m_vehicle->ejectDisc();
        call("GlobalSource", "setAudioSource", {4, -1});
        QCOMPARE(number("GlobalSource", "mainAudioSource"), 1);
        m_vehicle->insertDisc();
        QCOMPARE(number("CDSource", "cdStatus"), 1);
        m_vehicle->advance(2500);
        call("GlobalSource", "setAudioSource", {4, -1});
        QCOMPARE(number("GlobalSource", "mainAudioSource"), 4);
        QCOMPARE(number("CDSource", "cdStatus"), 2);
        call("CDSource", "togglePlayPause", {3});
        QCOMPARE(number("CDSource", "cdStatus"), 3);
        call("CDSource", "nextTrack");
        QCOMPARE(number("CDSource", "track"), 2);
        call("CDSource", "previousTrack");
        call("CDSource", "previousTrack");
        QCOMPARE(number("CDSource", "track"), 7);
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

    void callsInterruptWhatPlays()
    {
        call("GlobalSource", "setAudioSource", {4, -1});
        m_vehicle->ring(QStringLiteral("+1 555 0100"));
        QCOMPARE(number("CDSource", "cdStatus"), 3);
        call("PhoneSource", "rejectCall");
        QCOMPARE(number("CDSource", "cdStatus"), 2);
        call("CDSource", "togglePlayPause", {3});
        m_vehicle->ring(QStringLiteral("+1 555 0100"));
        call("PhoneSource", "rejectCall");
        QCOMPARE(number("CDSource", "cdStatus"), 3); // it did not play before
    }

    void theDiscThatPlaysIsTakenOut()
    {
        call("GlobalSource", "setAudioSource", {16, -1});
        call("GlobalSource", "setAudioSource", {4, -1});
        m_vehicle->ejectDisc();
        QCOMPARE(number("GlobalSource", "mainAudioSource"), 16);
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(true));
    }

    void discIsWound()
    {
        call("GlobalSource", "setAudioSource", {4, -1});
        call("GlobalSource", "sendLongSeekUp");
        m_vehicle->advance(1000);
        call("GlobalSource", "sendLongReleasedSeekUp");
        QCOMPARE(number("CDSource", "position"), 21);
    }

    void projectedPhoneIsASourceOfSoundWhileItIsThere_data()
    {
        QTest::addColumn<int>("mode");
        QTest::addColumn<int>("source");
        QTest::newRow("wired") << 1 << 34;
        QTest::newRow("wireless") << 2 << 35;
    }

    void projectedPhoneIsASourceOfSoundWhileItIsThere()
    {
        QFETCH(int, mode);
        QFETCH(int, source);
        call("GlobalSource", "setAudioSource", {16, -1});
        call("GlobalSource", "setAudioSource", {source, -1});
        QCOMPARE(number("GlobalSource", "mainAudioSource"), 16);
        m_vehicle->setProjectionMode(mode);
        call("GlobalSource", "setAudioSource", {69 - source, -1});
        QCOMPARE(number("GlobalSource", "mainAudioSource"), 16);
        call("GlobalSource", "setAudioSource", {12, -1});
        QCOMPARE(number("GlobalSource", "mainAudioSource"), source);
        QCOMPARE(value("ProjectionSource", "projectedPlaying"), QJsonValue(true));
        m_vehicle->setProjectionMode(0);
        QCOMPARE(number("GlobalSource", "mainAudioSource"), 16);
        QCOMPARE(value("ProjectionSource", "projectedPlaying"), QJsonValue(false));
        QCOMPARE(textOf("ProjectionSource", "projectedTitle"), QString());
    }

    void projectedPhoneUnderstandsKeys()
    {
        const auto press = [this](int key) {
            call("ProjectionSource", "projectionButtonPress", {key});
            call("ProjectionSource", "projectionButtonRelease", {key});
            call("ProjectionSource", "projectionButtonLongPress", {key, false});
        };
        m_vehicle->setProjectionMode(1);
        call("GlobalSource", "setAudioSource", {34, -1});
        const QString first = textOf("ProjectionSource", "projectedTitle");
        press(89);
        const QString second = textOf("ProjectionSource", "projectedTitle");
        QVERIFY(first != second);
        press(88);
        QCOMPARE(textOf("ProjectionSource", "projectedTitle"), first);
        press(83);
        QCOMPARE(value("ProjectionSource", "projectedPlaying"), QJsonValue(false));
        call("ProjectionSource", "projectionButtonPress", {89});
        call("ProjectionSource", "projectionButtonLongPress", {89, true});
        call("ProjectionSource", "projectionButtonRelease", {89});
        QCOMPARE(textOf("ProjectionSource", "projectedTitle"), first); // held: something else
        m_vehicle->ringProjectedPhone();
        QCOMPARE(number("ProjectionSource", "dioCallStatus"), 1);
        press(79);
        QCOMPARE(number("ProjectionSource", "dioCallStatus"), 2);
        press(80);
        QCOMPARE(number("ProjectionSource", "dioCallStatus"), 0);
        press(2000000000);
    }

    void voiceSessionGoesOnToACall()
    {
        call("GlobalSource", "sendPressedVoicePTTKey");
        m_vehicle->hear(QStringLiteral("call"));
        QCOMPARE(number("SpeechSource", "sessionState"), 2);
        m_vehicle->hear(QStringLiteral("dana whitfield"));
        QCOMPARE(number("SpeechSource", "sessionState"), 3);
        QVERIFY(textOf("SpeechSource", "promptText").contains(QStringLiteral("dana whitfield")));
        m_vehicle->hear(QStringLiteral("yes"));
        QCOMPARE(number("SpeechSource", "sessionState"), 0);
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(true));
        QCOMPARE(textOf("PhoneSource", "callerNumber"), QStringLiteral("+1 555 0100"));
        m_vehicle->answerFarEnd();
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(true));
        m_vehicle->hangUpFarEnd();
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(false));
    }

    void heldPushToTalkReachesThePhonesVoiceService()
    {
        call("GlobalSource", "sendLongPressedVoicePTTKey");
        QCOMPARE(value("PhoneSource", "phoneVoiceServiceActive"), QJsonValue(true));
        m_vehicle->advance(8000);
        QCOMPARE(value("PhoneSource", "phoneVoiceServiceActive"), QJsonValue(false));
        m_vehicle->setPhoneConnected(false);
        call("GlobalSource", "sendLongPressedVoicePTTKey");
        QCOMPARE(number("SpeechSource", "sessionState"), 1);
    }

    void phonesAssistantListensForAWhile()
    {
        call("PhoneSource", "toggleSiriActivation", {true});
        QCOMPARE(value("PhoneSource", "siriActive"), QJsonValue(true));
        m_vehicle->advance(8000);
        QCOMPARE(value("PhoneSource", "siriActive"), QJsonValue(false));
        m_vehicle->setState(QStringLiteral("PhoneSource"), QStringLiteral("siriEnabled"), false);
        call("PhoneSource", "toggleSiriActivation", {true});
        QCOMPARE(value("PhoneSource", "siriActive"), QJsonValue(false));
    }

    void withoutAPhoneNothingRings()
    {
        m_vehicle->setPhoneConnected(false);
        m_vehicle->ring(QStringLiteral("+1 555 0100"));
        call("PhoneSource", "dial", {QStringLiteral("+1 555 0100")});
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(false));
    }

    void powerOffIsSilent()
    {
        call("GlobalSource", "setAudioSource", {16, -1});
        call("GlobalSource", "sendPowerOnOffKeyPressed");
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(false));
        call("GlobalSource", "sendPowerOnOffKeyPressed");
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(true));
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

    void mediaPlaysOnWhileItIsTheSource()
    {
        m_vehicle->advance(5000);
        QCOMPARE(number("MediaAudioSource", "position"), 0);
        call("GlobalSource", "setAudioSource", {16, -1});
        m_vehicle->advance(5000);
        QCOMPARE(number("MediaAudioSource", "position"), 5);
        call("MediaAudioSource", "previous");
        QCOMPARE(number("MediaAudioSource", "position"), 0);
        QCOMPARE(number("MediaAudioSource", "trackIndex"), 0);
        call("MediaAudioSource", "previous");
        QCOMPARE(number("MediaAudioSource", "trackIndex"), 15);
        m_vehicle->advance(number("MediaAudioSource", "duration") * 1000);
        QCOMPARE(number("MediaAudioSource", "trackIndex"), 0);
        call("MediaAudioSource", "togglePlayPause");
        const int position = number("MediaAudioSource", "position");
        m_vehicle->advance(5000);
        QCOMPARE(number("MediaAudioSource", "position"), position);
        call("MediaAudioSource", "playTrack", {99});
        QCOMPARE(number("MediaAudioSource", "trackIndex"), 0);
    }

    void callIsTakenAndEnded()
    {
        m_vehicle->ring(QStringLiteral("+1 555 0100"));
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(true));
        QCOMPARE(textOf("PhoneSource", "callerName"), QStringLiteral("Dana Whitfield"));
        call("PhoneSource", "acceptCall");
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(true));
        m_vehicle->advance(3000);
        QCOMPARE(number("PhoneSource", "callDuration"), 3);
        call("GlobalSource", "sendShortEndKey");
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(false));
        QCOMPARE(textOf("PhoneSource", "callerNumber"), QString());
    }

    void callRingsInVain()
    {
        m_vehicle->ring(QStringLiteral("+1 555 9999"));
        QCOMPARE(textOf("PhoneSource", "callerName"), QString());
        m_vehicle->advance(30000);
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
    }

    void diallingTakesAMoment()
    {
        call("PhoneSource", "dial", {QStringLiteral("  ")});
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(false));
        call("PhoneSource", "dial", {QStringLiteral("+1 555 0101")});
        QCOMPARE(value("PhoneSource", "dialling"), QJsonValue(true));
        m_vehicle->ring(QStringLiteral("+1 555 0100")); // busy
        QCOMPARE(value("PhoneSource", "incomingCall"), QJsonValue(false));
        m_vehicle->advance(4000);
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(true));
        call("PhoneSource", "hangUp");
        QCOMPARE(value("PhoneSource", "callConnected"), QJsonValue(false));
    }

    void pushToTalkStartsASessionThatEnds()
    {
        call("GlobalSource", "sendPressedVoicePTTKey");
        QCOMPARE(number("SpeechSource", "sessionState"), 1);
        call("SpeechSource", "cancelVRSession");
        QCOMPARE(number("SpeechSource", "sessionState"), 0);
        call("GlobalSource", "sendPressedVoicePTTKey");
        m_vehicle->advance(8000);
        QCOMPARE(number("SpeechSource", "sessionState"), 0);
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
