// SPDX-License-Identifier: MIT
#pragma once

#include "decision.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/BezelDiagnosticsSource>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/EAPhoneSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/ProjectionSource>
#include <AL2HMIBridge/SpeechSource>
#include <AL2HMIBridge/ValetModeSource>
#include <AL2HMIBridge/XMTunerSource>

/// What the key rules ask the vehicle. Every answer is asked for afresh, and noted while a decision is being explained.
namespace HmiCore::HardKeySources {

/// Numbers of the main audio source; a tuner's mode is the same number.
enum AudioSource {
    Am = 0,
    Fm = 1,
    Satellite = 2,
    Dab = 3,
    Cd = 4,
    WeatherBand = 5,
    NextSource = 12,
    Media = 16,
    ProjectionFirst = 34,
    ProjectionSecond = 35
};

/// The decision that is being explained, null for none. Set in the GUI thread, where keys are decided.
inline Decision* explained = nullptr;

template <typename Value>
Value noted(const char* name, Value value)
{
    if (Q_UNLIKELY(explained))
        explained->saw(name, int(value));
    return value;
}

// What a source says, with its name for the explanation.
#define HMI_ASK(source, getter) noted(#source "." #getter, AL2HMIBridge::source::instance()->getter())

inline int mainAudioSource()
{
    return HMI_ASK(GlobalSource, mainAudioSource);
}

template <int... sources>
bool mainIs()
{
    const int source = mainAudioSource();
    return ((source == sources) || ...);
}

inline bool valetMode()
{
    return HMI_ASK(ValetModeSource, valetModeEnabled);
}

inline bool eventsBlocked()
{
    return HMI_ASK(EAPhoneSource, eventsBlocked);
}

inline bool fmLostHdSignal()
{
    return mainIs<Fm>() && HMI_ASK(FMTunerSource, hdSignalLossStatus) != 0;
}

inline bool satelliteReplay()
{
    return mainIs<Satellite>() && HMI_ASK(XMTunerSource, replayStatus) != 0;
}

/// The sources whose seek starts when the key goes down.
inline bool seekingTuner()
{
    return mainIs<Am, Fm>() || (mainIs<Satellite>() && !satelliteReplay());
}

inline bool projectionPlays()
{
    return mainIs<ProjectionFirst, ProjectionSecond>();
}

inline bool incomingCall()
{
    return HMI_ASK(PhoneSource, incomingCall);
}

inline bool callInVehicle()
{
    return HMI_ASK(PhoneSource, callConnected) && !HMI_ASK(PhoneSource, privateMode);
}

inline bool incomingOrConnectedCall()
{
    return incomingCall() || HMI_ASK(PhoneSource, callConnected);
}

inline bool projectedCall()
{
    return HMI_ASK(ProjectionSource, dioCallStatus) != 0;
}

inline bool noVoiceSession()
{
    return HMI_ASK(SpeechSource, sessionState) == 0;
}

/// No voice session runs, and the phone's assistant is there and switched on.
inline bool assistantUsable()
{
    return noVoiceSession() && HMI_ASK(PhoneSource, siriSupported) && HMI_ASK(PhoneSource, siriEnabled);
}

inline bool assistantListening()
{
    return assistantUsable() && HMI_ASK(PhoneSource, siriActive);
}

inline bool assistantSwitchedOff()
{
    return noVoiceSession() && HMI_ASK(PhoneSource, siriSupported) && !HMI_ASK(PhoneSource, siriEnabled);
}

inline bool phoneVoiceService()
{
    return noVoiceSession() && HMI_ASK(PhoneSource, phoneVoiceServiceActive);
}

inline bool voiceRecognitionReady()
{
    return HMI_ASK(SpeechSource, voiceRecognitionEngineReady);
}

inline bool diagnosticsActive()
{
    return HMI_ASK(BezelDiagnosticsSource, bezelDiagnosticsActive);
}

inline int cdStatus()
{
    return HMI_ASK(CDSource, cdStatus);
}

inline int satellitePlayStatus()
{
    return HMI_ASK(XMTunerSource, playStatus);
}

template <typename Tuner>
bool announcing()
{
    return noted("announcementType", Tuner::instance()->announcementType()) != 0;
}

/// The place of the active preset in its bank of six: 1 to 6, less when none of the bank is active.
template <typename Tuner>
int presetPosition()
{
    constexpr int bankSize = 6;
    const Tuner* const tuner = Tuner::instance();
    return noted("activePreset", tuner->activePreset())
           - bankSize * noted("activePresetBank", tuner->activePresetBank());
}

} // namespace HmiCore::HardKeySources
