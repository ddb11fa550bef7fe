// SPDX-License-Identifier: MIT
#include "vehiclefixture.h"

/// Sources of sound and their volume: what plays, what interrupts it.
class SoundTest : public VehicleFixture
{
    Q_OBJECT

private Q_SLOTS:
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

    void powerOffIsSilent()
    {
        call("GlobalSource", "setAudioSource", {16, -1});
        call("GlobalSource", "sendPowerOnOffKeyPressed");
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(false));
        call("GlobalSource", "sendPowerOnOffKeyPressed");
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(true));
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
};

QTEST_GUILESS_MAIN(SoundTest)
#include "tst_sound.moc"
