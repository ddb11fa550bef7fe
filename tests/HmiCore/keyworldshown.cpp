// SPDX-License-Identifier: MIT
#include "keyworldshown.h"

#include <AL2HMIBridge/BridgeTester>

#include <tuple>

using AL2HMIBridge::BridgeTester;

namespace {

auto all(const KeyWorld::Tuner& tuner)
{
    return std::tie(tuner.autoStoreInProgress, tuner.announcementType, tuner.trafficAnnouncementEnabled,
                    tuner.activePreset, tuner.activePresetBank);
}

bool showTuners(const KeyWorld& world, const KeyWorld& before)
{
    const char* const names[] = {"AMTunerSource", "FMTunerSource", "XMTunerSource", "DABTunerSource"};
    bool shown = true;
    for (size_t i = 0; i < world.tuners.size(); ++i) {
        const KeyWorld::Tuner& tuner = world.tuners[i];
        if (all(tuner) == all(before.tuners[i]))
            continue;
        shown = BridgeTester::setState(names[i], {{"autoStoreInProgress", tuner.autoStoreInProgress != 0},
                                                  {"announcementType", tuner.announcementType},
                                                  {"trafficAnnouncementEnabled", tuner.trafficAnnouncementEnabled != 0},
                                                  {"activePreset", tuner.activePreset},
                                                  {"activePresetBank", tuner.activePresetBank}})
                && shown;
    }
    return shown;
}

struct Field
{
    int KeyWorld::*value;
    const char* source;
    const char* name;
    bool isSwitch;
};

const Field fields[] = {
    {&KeyWorld::mainAudioSource, "GlobalSource", "mainAudioSource", false},
    {&KeyWorld::hdSignalLoss, "FMTunerSource", "hdSignalLossStatus", false},
    {&KeyWorld::replay, "XMTunerSource", "replayStatus", false},
    {&KeyWorld::satellitePlays, "XMTunerSource", "playStatus", false},
    {&KeyWorld::cdStatus, "CDSource", "cdStatus", false},
    {&KeyWorld::projectionMode, "ProjectionSource", "projectionMode", false},
    {&KeyWorld::projectedCall, "ProjectionSource", "dioCallStatus", false},
    {&KeyWorld::eventsBlocked, "EAPhoneSource", "eventsBlocked", true},
    {&KeyWorld::incomingCall, "PhoneSource", "incomingCall", true},
    {&KeyWorld::callConnected, "PhoneSource", "callConnected", true},
    {&KeyWorld::privateMode, "PhoneSource", "privateMode", true},
    {&KeyWorld::siriSupported, "PhoneSource", "siriSupported", true},
    {&KeyWorld::siriEnabled, "PhoneSource", "siriEnabled", true},
    {&KeyWorld::siriActive, "PhoneSource", "siriActive", true},
    {&KeyWorld::phoneVoiceService, "PhoneSource", "phoneVoiceServiceActive", true},
    {&KeyWorld::voiceSession, "SpeechSource", "sessionState", false},
    {&KeyWorld::spokenText, "SpeechSource", "ttsSessionActive", true},
    {&KeyWorld::recogniserReady, "SpeechSource", "voiceRecognitionEngineReady", true},
    {&KeyWorld::valetMode, "ValetModeSource", "valetModeEnabled", true},
    {&KeyWorld::diagnostics, "BezelDiagnosticsSource", "bezelDiagnosticsActive", true},
};

} // namespace

bool showKeyWorld(const KeyWorld& world, const KeyWorld& before)
{
    bool shown = showTuners(world, before);
    for (const Field& field : fields) {
        const int value = world.*field.value;
        if (value == before.*field.value)
            continue;
        const QVariant state = field.isSwitch ? QVariant(value != 0) : QVariant(value);
        shown = BridgeTester::setState(field.source, {{field.name, state}}) && shown;
    }
    return shown;
}
