// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

#include <array>

/// What the hard keys look at, as plain numbers.
struct KeyWorld
{
    struct Tuner
    {
        int autoStoreInProgress = 0;
        int announcementType = 0;
        int trafficAnnouncementEnabled = 0;
        int activePreset = 0;
        int activePresetBank = 0;
    };

    int mainAudioSource = 1;
    int hdSignalLoss = 0;
    int replay = 0;
    int satellitePlays = 0;
    int cdStatus = 0;
    int projectionMode = 0;
    int projectedCall = 0;
    int eventsBlocked = 0;
    int incomingCall = 0;
    int callConnected = 0;
    int privateMode = 0;
    int siriSupported = 0;
    int siriEnabled = 0;
    int siriActive = 0;
    int phoneVoiceService = 0;
    int voiceSession = 0;
    int spokenText = 0;
    int recogniserReady = 1;
    int valetMode = 0;
    int diagnostics = 0;
    std::array<Tuner, 4> tuners; ///< AM, FM, satellite, DAB: the order of their modes
};

/// What a key leads to, worked out apart from the controller and in another manner: by following one key through.
QStringList expectedKeyCalls(unsigned int key, int state, const KeyWorld& world);
