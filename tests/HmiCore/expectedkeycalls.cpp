// SPDX-License-Identifier: MIT
#include "expectedkeycalls.h"

namespace {

/// One key on its way; everything it does is appended to `done`.
class Walk
{
public:
    Walk(unsigned int key, int state, const KeyWorld& world)
        : k(key)
        , s(state)
        , w(world)
    {
    }

    QStringList run()
    {
        if (w.projectionMode != 0 && k >= 6 && k <= 91 && takenByProjection())
            return done;
        if (s == 0)
            pressCancels();
        if (k >= 6 && k <= 89)
            ordinaryKey();
        return done;
    }

private:
    const unsigned int k;
    const int s;
    const KeyWorld& w;
    QStringList done;

    void call(const QString& text) { done.append(text); }
    void call(const char* text) { done.append(QString::fromLatin1(text)); }
    bool replaying() const { return w.mainAudioSource == 2 && w.replay != 0; }
    bool hdLost() const { return w.mainAudioSource == 1 && w.hdSignalLoss != 0; }
    bool projectedAudio() const { return w.mainAudioSource == 34 || w.mainAudioSource == 35; }

    bool takenByProjection()
    {
        switch (k) {
        case 6:
        case 7:
        case 83:
        case 88:
        case 89:
            if (!projectedAudio())
                return false;
            toPhone();
            return true;
        case 10:
            toPhone();
            return true;
        case 12:
        case 49:
        case 50:
        case 79:
        case 80:
            if (!w.eventsBlocked)
                toPhone();
            return true;
        case 77:
        case 78:
        case 90:
        case 91:
            if (w.eventsBlocked)
                return true;
            if (w.incomingCall || (w.callConnected && !w.privateMode) || w.projectedCall || projectedAudio())
                toPhone();
            else
                combinedKey();
            return true;
        default:
            return false;
        }
    }

    void toPhone()
    {
        const QString press = QStringLiteral("ProjectionSource.projectionButtonPress(%1)").arg(k);
        const QString release = QStringLiteral("ProjectionSource.projectionButtonRelease(%1)").arg(k);
        const QString held = QStringLiteral("ProjectionSource.projectionButtonLongPress(%1, %2)").arg(k);
        if (s == 0) {
            call(press);
        } else if (s == 2) {
            call(release);
            call(held.arg(QLatin1String("false")));
        } else if (s == 3) {
            call(held.arg(QLatin1String("true")));
        } else if (s == 4) {
            call(release);
        }
    }

    void combinedKey()
    {
        if (k == 90)
            return wheel("Down");
        if (k == 91)
            return wheel("Up");
        if (s != 2)
            return;
        if (k == 77 && hdLost())
            call("FMTunerSource.tune(\"98.5\", \"-1\")");
        else if (replaying())
            call(k == 77 ? "XMTunerSource.seekReverseShort()" : "XMTunerSource.seekForwardShort()");
        else
            call(k == 77 ? "GlobalSource.sendShortSeekDown()" : "GlobalSource.sendShortSeekUp()");
    }

    void pressCancels()
    {
        const bool isVolume = k == 8 || k == 9;
        if (w.voiceSession && !isVolume && k != 10)
            call("SpeechSource.cancelVRSession()");
        if (w.spokenText && !isVolume)
            call("SpeechSource.cancelTTSSession()");
        if (!isVolume && w.tuners[0].autoStoreInProgress)
            call("AMTunerSource.sendAutoStoreCancel()");
        if (!isVolume && w.tuners[1].autoStoreInProgress)
            call("FMTunerSource.sendAutoStoreCancel()");
    }

    void ordinaryKey()
    {
        switch (k) {
        case 6:
            return seek(true);
        case 7:
            return seek(false);
        case 8:
            return volume("Up");
        case 9:
            return volume("Down");
        case 10:
            return pushToTalk();
        case 13:
            if (s == 2)
                call("GlobalSource.setAudioSource(12, -1)");
            return;
        case 15:
            if (s == 2)
                call("GlobalSource.setAudioSource(4, -1)");
            return;
        case 22:
        case 23:
        case 24:
        case 25:
        case 26:
        case 27:
            return preset(int(k) - 21);
        case 35:
            return traffic();
        case 41:
            if (s == 2 && !w.valetMode)
                call("GlobalSource.sendPowerOnOffKeyPressed()");
            return;
        case 47:
            if (s == 2)
                call(QStringLiteral("GlobalSource.setAudioSource(2, %1)").arg(w.tuners[2].activePresetBank));
            return;
        case 48:
            if (s == 2)
                call("GlobalSource.sendShortReleasedMuteKey()");
            return;
        case 50:
            if (s == 2 && !w.eventsBlocked)
                call("GlobalSource.sendShortEndKey()");
            return;
        case 54:
            return tune(false);
        case 55:
            return tune(true);
        case 60:
            if (s == 2)
                call("intent 64");
            return;
        case 83:
            return playPause();
        case 88:
            return wheel("Down");
        case 89:
            return wheel("Up");
        default:
            return;
        }
    }

    void seek(bool down)
    {
        const QString direction = QLatin1String(down ? "Down" : "Up");
        const QString replayed =
            QStringLiteral("XMTunerSource.seek%1").arg(QLatin1String(down ? "Reverse" : "Forward"));
        const int m = w.mainAudioSource;
        if (s == 0) {
            if (down && hdLost())
                call("FMTunerSource.tune(\"98.5\", \"-1\")");
            else if (m == 0 || m == 1 || (m == 2 && !replaying()))
                call(QStringLiteral("GlobalSource.sendShortSeek%1()").arg(direction));
        } else if (s == 2) {
            if (m < 0 || m > 2)
                call(QStringLiteral("GlobalSource.sendShortSeek%1()").arg(direction));
            else if (replaying())
                call(replayed + QLatin1String("Short()"));
        } else if (s == 3) {
            call(replaying() ? replayed + QLatin1String("Long(1)")
                             : QStringLiteral("GlobalSource.sendLongSeek%1()").arg(direction));
        } else if (s == 4) {
            call(replaying() ? replayed + QLatin1String("Long(0)")
                             : QStringLiteral("GlobalSource.sendLongReleasedSeek%1()").arg(direction));
        }
    }

    void volume(const char* direction)
    {
        if (w.valetMode)
            return;
        const QString key = QStringLiteral("GlobalSource.send%1Volume%2Key()");
        if (s == 2)
            call(key.arg(QLatin1String("ShortReleased"), QLatin1String(direction)));
        if (s == 3)
            call(key.arg(QLatin1String("LongPressed"), QLatin1String(direction)));
        if (s == 4)
            call(key.arg(QLatin1String("LongReleased"), QLatin1String(direction)));
        if (s == 0 || s == 3)
            call("GlobalSource.systemVolumeSync()");
    }

    void pushToTalk()
    {
        if (w.valetMode || w.incomingCall || w.callConnected)
            return;
        if (!w.recogniserReady)
            return call("SpeechSource.voiceRecognitionNotReadyError()");
        if (w.diagnostics)
            return;
        const bool free = w.voiceSession == 0;
        if (s == 2) {
            const bool listening = free && w.siriSupported && w.siriEnabled && w.siriActive;
            call(listening ? "PhoneSource.toggleSiriActivation(true)" : "GlobalSource.sendPressedVoicePTTKey()");
        } else if (s == 3) {
            if (free && w.siriSupported && w.siriEnabled)
                call(w.siriActive ? "PhoneSource.toggleSiriActivation(false)"
                                  : "PhoneSource.toggleSiriActivation(true)");
            else if (free && w.siriSupported)
                call("intent 47");
            else if (free && w.phoneVoiceService)
                call("PhoneSource.togglePhoneVoiceServiceActivation(false)");
            else
                call("GlobalSource.sendLongPressedVoicePTTKey()");
        }
    }

    void preset(int number)
    {
        if (s == 2)
            call(QStringLiteral("GlobalSource.sendShortPresetKey(%1)").arg(number));
        if (s != 3)
            return;
        const int m = w.mainAudioSource;
        if (m == 0 || m == 1 || m == 2 || m == 5)
            call("GlobalSource.requestBeepSound()");
        call(QStringLiteral("GlobalSource.sendLongPresetKey(%1)").arg(number));
    }

    void traffic()
    {
        if (s != 2)
            return;
        struct Candidate
        {
            int mode;
            const char* name;
        };
        const Candidate candidates[] = {{1, "FM"}, {0, "AM"}, {3, "DAB"}};
        for (const Candidate& candidate : candidates) {
            const int type = w.tuners[size_t(candidate.mode)].announcementType;
            if (type == 0)
                continue;
            call(QStringLiteral("%1TunerSource.cancelAnnouncement(%2)").arg(QLatin1String(candidate.name)).arg(type));
            return call("intent 52");
        }
        for (const Candidate& candidate : candidates)
            if (w.mainAudioSource == candidate.mode)
                call(QStringLiteral("%1TunerSource.toggleTpSeekInProgress(%2, %3)")
                         .arg(QLatin1String(candidate.name))
                         .arg(candidate.mode)
                         .arg(QLatin1String(w.tuners[size_t(candidate.mode)].trafficAnnouncementEnabled ? "false"
                                                                                                        : "true")));
    }

    void tune(bool down)
    {
        const int m = w.mainAudioSource;
        const QString key = QStringLiteral("GlobalSource.send%1Tune%2Key()")
                                .arg(QStringLiteral("%1"), QLatin1String(down ? "Down" : "Up"));
        if (s == 0 && down && hdLost())
            call("FMTunerSource.tune(\"98.5\", \"-1\")");
        else if (s == 0 && m >= 0 && m <= 3)
            call(key.arg(QLatin1String("Pressed")));
        else if (s == 1 && m == 4)
            call(down ? "CDSource.previousTrack()" : "CDSource.nextTrack()");
        else if (s == 3)
            call(key.arg(QLatin1String("LongPressed")));
        else if (s == 4)
            call(key.arg(QLatin1String("LongReleased")));
    }

    void playPause()
    {
        if (s != 2)
            return;
        if (w.mainAudioSource == 4 && w.cdStatus == 2)
            call("CDSource.togglePlayPause(3)");
        if (w.mainAudioSource == 4 && w.cdStatus == 3)
            call("CDSource.togglePlayPause(2)");
        if (w.mainAudioSource == 16)
            call("MediaAudioSource.togglePlayPause()");
        if (w.mainAudioSource == 2)
            call(w.satellitePlays == 0 ? "XMTunerSource.togglePlayPause(1)" : "XMTunerSource.togglePlayPause(0)");
    }

    void wheel(const char* direction)
    {
        const bool down = qstrcmp(direction, "Down") == 0;
        const QString name = QLatin1String(direction);
        const QString replayed =
            QStringLiteral("XMTunerSource.seek%1").arg(QLatin1String(down ? "Reverse" : "Forward"));
        if (s == 2) {
            wheelStep(down, replayed + QLatin1String("Short()"));
            call(QStringLiteral("signal swcSeek%1ShortPress").arg(name));
        } else if (s == 3 || s == 4) {
            if (replaying())
                return call(replayed + QLatin1String(s == 3 ? "Long(1)" : "Long(0)"));
            call(QStringLiteral("GlobalSource.sendLong%1Seek%2()").arg(QLatin1String(s == 3 ? "" : "Released"), name));
            call(QStringLiteral("signal swcSeek%1Long%2").arg(name, QLatin1String(s == 3 ? "Press" : "Release")));
        }
    }

    void wheelStep(bool down, const QString& replayStep)
    {
        const int m = w.mainAudioSource;
        if (m == 4)
            return call(down ? "CDSource.previousTrack()" : "CDSource.nextTrack()");
        if (m == 16)
            return call(down ? "MediaAudioSource.previous()" : "MediaAudioSource.next()");
        if (m < 0 || m > 3)
            return;
        if (down && hdLost())
            return call("FMTunerSource.tune(\"98.5\", \"-1\")");
        if (replaying())
            return call(replayStep);
        const char* const names[] = {"AM", "FM", "XM", "DAB"};
        const KeyWorld::Tuner& tuner = w.tuners[size_t(m)];
        const int p = tuner.activePreset - 6 * tuner.activePresetBank;
        int next = 0;
        if (down)
            next = p < 2 ? 6 : p - 1;
        else
            next = (p < 0 || p == 6) ? 1 : p + 1;
        call(QStringLiteral("%1TunerSource.recallPreset(%2, %3)").arg(QLatin1String(names[m])).arg(m).arg(next));
    }
};

} // namespace

QStringList expectedKeyCalls(unsigned int key, int state, const KeyWorld& world)
{
    return Walk(key, state, world).run();
}
