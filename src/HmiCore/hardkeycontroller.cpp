// SPDX-License-Identifier: MIT
#include "hardkeycontroller.h"

#include "hardkeyrules.h"
#include "logcategories.h"

#include <QCoreApplication>
#include <QQmlEngine>
#include <QScopedValueRollback>

namespace HmiCore {

using namespace AL2HMIBridge;
using namespace HardKeyRules;
using namespace HardKeySources;

/// The decisions as tables, tried from above; inside the controller, because they lead to its private operations.
struct Q_DECL_HIDDEN HardKeyController::Rules
{
    struct KeyRule
    {
        unsigned int key;
        int state;
        Rule rule;
    };
    struct ProjectionRule
    {
        KeySet keys;
        Rule rule;
    };

    static const KeyRule keys[];
    static const KeyRule nativeCombinations[];
    static const ProjectionRule projection[];

    static const Rule wheelSeekDown[];
    static const Rule wheelSeekUp[];
    static const Rule wheelSeekDownHeld[];
    static const Rule wheelSeekUpHeld[];
    static const Rule wheelSeekDownReleased[];
    static const Rule wheelSeekUpReleased[];
    static const Rule combinedSeekLeft[];
    static const Rule combinedSeekRight[];

    template <size_t count>
    static void applyFirst(const KeyRule (&rules)[count], HardKeyController& controller, const KeyEvent& event);
};

// clang-format off

/// What keys do, in the order of their numbers. The downward keys alone look for a lost digital signal.
constexpr HardKeyController::Rules::KeyRule HardKeyController::Rules::keys[] = {
    {SeekDown, Pressed,      {WHEN(fmLostHdSignal()), DO(retuneFm())}},
    {SeekDown, Pressed,      {WHEN(seekingTuner()), DO(global().sendShortSeekDown())}},
    {SeekDown, ShortRelease, {WHEN(!mainIs<Am, Fm, Satellite>()), DO(global().sendShortSeekDown())}},
    {SeekDown, ShortRelease, {WHEN(satelliteReplay()), DO(satellite().seekReverseShort())}},
    {SeekDown, LongPress,    {WHEN(satelliteReplay()), DO(satellite().seekReverseLong(start))}},
    {SeekDown, LongPress,    {always, DO(global().sendLongSeekDown())}},
    {SeekDown, LongRelease,  {WHEN(satelliteReplay()), DO(satellite().seekReverseLong(stop))}},
    {SeekDown, LongRelease,  {always, DO(global().sendLongReleasedSeekDown())}},

    {SeekUp, Pressed,      {WHEN(seekingTuner()), DO(global().sendShortSeekUp())}},
    {SeekUp, ShortRelease, {WHEN(!mainIs<Am, Fm, Satellite>()), DO(global().sendShortSeekUp())}},
    {SeekUp, ShortRelease, {WHEN(satelliteReplay()), DO(satellite().seekForwardShort())}},
    {SeekUp, LongPress,    {WHEN(satelliteReplay()), DO(satellite().seekForwardLong(start))}},
    {SeekUp, LongPress,    {always, DO(global().sendLongSeekUp())}},
    {SeekUp, LongRelease,  {WHEN(satelliteReplay()), DO(satellite().seekForwardLong(stop))}},
    {SeekUp, LongRelease,  {always, DO(global().sendLongReleasedSeekUp())}},

    {VolumeUp, AnyState,     {WHEN(valetMode()), nothing}},
    {VolumeUp, Pressed,      {always, DO(global().systemVolumeSync())}},
    {VolumeUp, ShortRelease, {always, DO(global().sendShortReleasedVolumeUpKey())}},
    {VolumeUp, LongPress,    {always, DO(global().sendLongPressedVolumeUpKey(); global().systemVolumeSync())}},
    {VolumeUp, LongRelease,  {always, DO(global().sendLongReleasedVolumeUpKey())}},

    {VolumeDown, AnyState,     {WHEN(valetMode()), nothing}},
    {VolumeDown, Pressed,      {always, DO(global().systemVolumeSync())}},
    {VolumeDown, ShortRelease, {always, DO(global().sendShortReleasedVolumeDownKey())}},
    {VolumeDown, LongPress,    {always, DO(global().sendLongPressedVolumeDownKey(); global().systemVolumeSync())}},
    {VolumeDown, LongRelease,  {always, DO(global().sendLongReleasedVolumeDownKey())}},

    {PushToTalk, AnyState,     {WHEN(valetMode()), nothing}},
    {PushToTalk, AnyState,     {WHEN(incomingOrConnectedCall()), nothing}},
    {PushToTalk, AnyState,     {WHEN(!voiceRecognitionReady()), DO(SpeechSource::instance()->voiceRecognitionNotReadyError())}},
    {PushToTalk, AnyState,     {WHEN(diagnosticsActive()), nothing}},
    {PushToTalk, ShortRelease, {WHEN(assistantListening()), DO(PhoneSource::instance()->toggleSiriActivation(true))}},
    {PushToTalk, ShortRelease, {always, DO(global().sendPressedVoicePTTKey())}},
    {PushToTalk, LongPress,    {WHEN(assistantListening()), DO(PhoneSource::instance()->toggleSiriActivation(false))}},
    {PushToTalk, LongPress,    {WHEN(assistantUsable()), DO(PhoneSource::instance()->toggleSiriActivation(true))}},
    {PushToTalk, LongPress,    {WHEN(assistantSwitchedOff()), DO(request(HmiIntentManager::PhoneSiriNotEnabled))}},
    {PushToTalk, LongPress,    {WHEN(phoneVoiceService()), DO(PhoneSource::instance()->togglePhoneVoiceServiceActivation(false))}},
    {PushToTalk, LongPress,    {always, DO(global().sendLongPressedVoicePTTKey())}},

    {SourceKey, ShortRelease, {always, DO(setAudioSource(NextSource))}},
    {CdKey,     ShortRelease, {always, DO(setAudioSource(Cd))}},

    {Preset1, ShortRelease, {always, DO(global().sendShortPresetKey(presetOf(event)))}}, // to Preset6
    {Preset1, LongPress,    {always, DO(controller.requestBeepForStoringPreset(); global().sendLongPresetKey(presetOf(event)))}},

    {TrafficKey, ShortRelease, {WHEN(announcing<FMTunerSource>()), DO(cancelAnnouncement<FMTunerSource>())}},
    {TrafficKey, ShortRelease, {WHEN(announcing<AMTunerSource>()), DO(cancelAnnouncement<AMTunerSource>())}},
    {TrafficKey, ShortRelease, {WHEN(announcing<DABTunerSource>()), DO(cancelAnnouncement<DABTunerSource>())}},
    {TrafficKey, ShortRelease, {WHEN(mainIs<Fm>()), DO(toggleTrafficAnnouncements<FMTunerSource, Fm>())}},
    {TrafficKey, ShortRelease, {WHEN(mainIs<Am>()), DO(toggleTrafficAnnouncements<AMTunerSource, Am>())}},
    {TrafficKey, ShortRelease, {WHEN(mainIs<Dab>()), DO(toggleTrafficAnnouncements<DABTunerSource, Dab>())}},

    {Power,         ShortRelease, {WHEN(!valetMode()), DO(global().sendPowerOnOffKeyPressed())}},
    {SatelliteBand, ShortRelease, {always, DO(setAudioSource(Satellite, satellite().activePresetBank()))}},
    {Mute,          ShortRelease, {always, DO(global().sendShortReleasedMuteKey())}},
    {PhoneEnd,      ShortRelease, {WHEN(!eventsBlocked()), DO(global().sendShortEndKey())}},

    {TuneUp, Pressed,     {WHEN(mainIs<Am, Fm, Satellite, Dab>()), DO(global().sendPressedTuneUpKey())}},
    {TuneUp, Stepped,     {WHEN(mainIs<Cd>()), DO(cd().nextTrack())}},
    {TuneUp, LongPress,   {always, DO(global().sendLongPressedTuneUpKey())}},
    {TuneUp, LongRelease, {always, DO(global().sendLongReleasedTuneUpKey())}},

    {TuneDown, Pressed,     {WHEN(fmLostHdSignal()), DO(retuneFm())}},
    {TuneDown, Pressed,     {WHEN(mainIs<Am, Fm, Satellite, Dab>()), DO(global().sendPressedTuneDownKey())}},
    {TuneDown, Stepped,     {WHEN(mainIs<Cd>()), DO(cd().previousTrack())}},
    {TuneDown, LongPress,   {always, DO(global().sendLongPressedTuneDownKey())}},
    {TuneDown, LongRelease, {always, DO(global().sendLongReleasedTuneDownKey())}},

    {DisplayKey, ShortRelease, {always, DO(request(HmiIntentManager::RequestDisplayToggle))}},

    {PlayPause, ShortRelease, {WHEN(mainIs<Cd>() && cdStatus() == 2), DO(cd().togglePlayPause(cdPlayPauseSecond))}},
    {PlayPause, ShortRelease, {WHEN(mainIs<Cd>() && cdStatus() == 3), DO(cd().togglePlayPause(cdPlayPauseFirst))}},
    {PlayPause, ShortRelease, {WHEN(mainIs<Media>()), DO(media().togglePlayPause())}},
    {PlayPause, ShortRelease, {WHEN(mainIs<Satellite>()), DO(satellite().togglePlayPause(satellitePlayStatus() == 0 ? 1 : 0))}},

    {WheelSeekDown, ShortRelease, {always, DO(controller.processSWCSeekDownShortPress())}},
    {WheelSeekDown, LongPress,    {always, DO(controller.processSWCSeekDownLongPress())}},
    {WheelSeekDown, LongRelease,  {always, DO(controller.processSWCSeekDownLongRelease())}},
    {WheelSeekUp,   ShortRelease, {always, DO(controller.processSWCSeekUpShortPress())}},
    {WheelSeekUp,   LongPress,    {always, DO(controller.processSWCSeekUpLongPress())}},
    {WheelSeekUp,   LongRelease,  {always, DO(controller.processSWCSeekUpLongRelease())}},
};

/// Keys that are one for the vehicle and the projected phone, when the vehicle keeps them.
constexpr HardKeyController::Rules::KeyRule HardKeyController::Rules::nativeCombinations[] = {
    {CombinedSeekLeft,      ShortRelease, {always, DO(controller.processCombinedSeekLeftKey())}},
    {CombinedSeekRight,     ShortRelease, {always, DO(controller.processCombinedSeekRightKey())}},
    {CombinedWheelSeekDown, ShortRelease, {always, DO(controller.processSWCSeekDownShortPress())}},
    {CombinedWheelSeekDown, LongPress,    {always, DO(controller.processSWCSeekDownLongPress())}},
    {CombinedWheelSeekDown, LongRelease,  {always, DO(controller.processSWCSeekDownLongRelease())}},
    {CombinedWheelSeekUp,   ShortRelease, {always, DO(controller.processSWCSeekUpShortPress())}},
    {CombinedWheelSeekUp,   LongPress,    {always, DO(controller.processSWCSeekUpLongPress())}},
    {CombinedWheelSeekUp,   LongRelease,  {always, DO(controller.processSWCSeekUpLongRelease())}},
};

#define HAND_OVER DO(controller.handleHardKeysAtProjection(int(event.key), static_cast<KeyState>(event.state)))
#define KEEP DO(controller.handleComboKeysForNativeHmi(int(event.key), static_cast<KeyState>(event.state)))

/// Where keys go during a projection session. A key for which nothing holds is an ordinary key.
constexpr HardKeyController::Rules::ProjectionRule HardKeyController::Rules::projection[] = {
    {{SeekDown, SeekUp, PlayPause, WheelSeekDown, WheelSeekUp}, {WHEN(projectionPlays()), HAND_OVER}},

    {{PushToTalk}, {always, HAND_OVER}},

    {{PhonePickUp, PhoneStart, PhoneEnd, WheelPhoneStart, WheelPhoneEnd}, {WHEN(eventsBlocked()), nothing}},
    {{PhonePickUp, PhoneStart, PhoneEnd, WheelPhoneStart, WheelPhoneEnd}, {always, HAND_OVER}},

    {{CombinedSeekLeft, CombinedSeekRight, CombinedWheelSeekDown, CombinedWheelSeekUp}, {WHEN(eventsBlocked()), nothing}},
    {{CombinedSeekLeft, CombinedSeekRight, CombinedWheelSeekDown, CombinedWheelSeekUp}, {WHEN(incomingCall()), HAND_OVER}},
    {{CombinedSeekLeft, CombinedSeekRight, CombinedWheelSeekDown, CombinedWheelSeekUp}, {WHEN(callInVehicle()), HAND_OVER}},
    {{CombinedSeekLeft, CombinedSeekRight, CombinedWheelSeekDown, CombinedWheelSeekUp}, {WHEN(projectedCall()), HAND_OVER}},
    {{CombinedSeekLeft, CombinedSeekRight, CombinedWheelSeekDown, CombinedWheelSeekUp}, {WHEN(projectionPlays()), HAND_OVER}},
    {{CombinedSeekLeft, CombinedSeekRight, CombinedWheelSeekDown, CombinedWheelSeekUp}, {always, KEEP}},
};

constexpr Rule HardKeyController::Rules::wheelSeekDown[] = {
    {WHEN(mainIs<Am>()), DO(recallPrevious<AMTunerSource, Am>())},
    {WHEN(fmLostHdSignal()), DO(retuneFm())},
    {WHEN(mainIs<Fm>()), DO(recallPrevious<FMTunerSource, Fm>())},
    {WHEN(satelliteReplay()), DO(satellite().seekReverseShort())},
    {WHEN(mainIs<Satellite>()), DO(recallPrevious<XMTunerSource, Satellite>())},
    {WHEN(mainIs<Dab>()), DO(recallPrevious<DABTunerSource, Dab>())},
    {WHEN(mainIs<Cd>()), DO(cd().previousTrack())},
    {WHEN(mainIs<Media>()), DO(media().previous())},
};

constexpr Rule HardKeyController::Rules::wheelSeekUp[] = {
    {WHEN(mainIs<Am>()), DO(recallNext<AMTunerSource, Am>())},
    {WHEN(mainIs<Fm>()), DO(recallNext<FMTunerSource, Fm>())},
    {WHEN(satelliteReplay()), DO(satellite().seekForwardShort())},
    {WHEN(mainIs<Satellite>()), DO(recallNext<XMTunerSource, Satellite>())},
    {WHEN(mainIs<Dab>()), DO(recallNext<DABTunerSource, Dab>())},
    {WHEN(mainIs<Cd>()), DO(cd().nextTrack())},
    {WHEN(mainIs<Media>()), DO(media().next())},
};

constexpr Rule HardKeyController::Rules::wheelSeekDownHeld[] = {
    {WHEN(satelliteReplay()), DO(satellite().seekReverseLong(start))},
    {always, DO(global().sendLongSeekDown(); Q_EMIT controller.swcSeekDownLongPress())},
};

constexpr Rule HardKeyController::Rules::wheelSeekUpHeld[] = {
    {WHEN(satelliteReplay()), DO(satellite().seekForwardLong(start))},
    {always, DO(global().sendLongSeekUp(); Q_EMIT controller.swcSeekUpLongPress())},
};

constexpr Rule HardKeyController::Rules::wheelSeekDownReleased[] = {
    {WHEN(satelliteReplay()), DO(satellite().seekReverseLong(stop))},
    {always, DO(global().sendLongReleasedSeekDown(); Q_EMIT controller.swcSeekDownLongRelease())},
};

constexpr Rule HardKeyController::Rules::wheelSeekUpReleased[] = {
    {WHEN(satelliteReplay()), DO(satellite().seekForwardLong(stop))},
    {always, DO(global().sendLongReleasedSeekUp(); Q_EMIT controller.swcSeekUpLongRelease())},
};

constexpr Rule HardKeyController::Rules::combinedSeekLeft[] = {
    {WHEN(fmLostHdSignal()), DO(retuneFm())},
    {WHEN(satelliteReplay()), DO(satellite().seekReverseShort())},
    {always, DO(global().sendShortSeekDown())},
};

constexpr Rule HardKeyController::Rules::combinedSeekRight[] = {
    {WHEN(satelliteReplay()), DO(satellite().seekForwardShort())},
    {always, DO(global().sendShortSeekUp())},
};

// clang-format on

template <size_t count>
void HardKeyController::Rules::applyFirst(const KeyRule (&rules)[count], HardKeyController& controller,
                                          const KeyEvent& event)
{
    const unsigned int row = event.key > Preset1 && event.key <= Preset6 ? Preset1 : event.key;
    for (const KeyRule& rule : rules)
        if (rule.key == row && (rule.state == event.state || rule.state == AnyState)
            && apply(rule.rule, controller, event))
            return;
}

HardKeyController* HardKeyController::instance()
{
    static auto* const controller = new HardKeyController(QCoreApplication::instance());
    return controller;
}

QObject* HardKeyController::hardKeyControllerProvider(QQmlEngine*, QJSEngine*)
{
    QQmlEngine::setObjectOwnership(instance(), QQmlEngine::CppOwnership);
    return instance();
}

HardKeyController::HardKeyController(QObject* parent)
    : QObject(parent)
{
    connect(KeySource::instance(), &KeySource::keyEvent, this,
            [this](int keyId, int keyState) { onHardKeyReceived(static_cast<uint32_t>(keyId), keyState); });
    connect(KeySource::instance(), &KeySource::keyComboEvent, this, &HardKeyController::onKeyComboEvent);
}

HardKeyController::~HardKeyController() = default;

void HardKeyController::onHardKeyReceived(uint32_t l_keyId, int r_keyState)
{
    qCDebug(performanceLog,
            "P12.R060.01, P12.R061.01, P12.R062.01 - Screen transition: Start Marker - Hardkey Button.");
    qCDebug(performanceLog, "P12.R056.01 - Changes to Visible state by Hard key: Start Marker");

    Decision decision;
    const QScopedValueRollback<Decision*> explanation(explained, decision.isWanted() ? &decision : nullptr);
    if (explained)
        decision.begin(QStringLiteral("key %1 state %2").arg(l_keyId).arg(r_keyState));

    const KeyEvent event{l_keyId, r_keyState};
    if (HMI_ASK(ProjectionSource, projectionMode) != 0) {
        for (const Rules::ProjectionRule& row : Rules::projection)
            if (row.keys.contains(event.key) && apply(row.rule, *this, event))
                return;
    }
    cancelVROnKeyPressed(l_keyId, r_keyState);
    cancelTTSOnKeyPressed(l_keyId, r_keyState);
    cancelAutoStoreUpdate(l_keyId, r_keyState);
    Rules::applyFirst(Rules::keys, *this, event);
}

void HardKeyController::onKeyComboEvent(int keyComboId, int keyState)
{
    if (keyComboId == systemLogsCombination && keyState == Combined)
        global().captureSystemLogs();
}

/// The volume is changed while one speaks, and the push-to-talk key leads a session on.
void HardKeyController::cancelVROnKeyPressed(unsigned int keyId, int keyState)
{
    constexpr KeySet exempt{VolumeUp, VolumeDown, PushToTalk};
    if (keyState != Pressed || exempt.contains(keyId) || noVoiceSession())
        return;
    if (explained)
        explained->note("cancelled the voice session");
    SpeechSource::instance()->cancelVRSession();
}

/// Push-to-talk is not exempt here: it interrupts a prompt.
void HardKeyController::cancelTTSOnKeyPressed(unsigned int keyId, int keyState)
{
    constexpr KeySet exempt{VolumeUp, VolumeDown};
    if (keyState != Pressed || exempt.contains(keyId) || !HMI_ASK(SpeechSource, ttsSessionActive))
        return;
    if (explained)
        explained->note("cancelled the spoken text");
    SpeechSource::instance()->cancelTTSSession();
}

void HardKeyController::cancelAutoStoreUpdate(unsigned int keyId, int keyState)
{
    constexpr KeySet exempt{VolumeUp, VolumeDown};
    if (keyState != Pressed || exempt.contains(keyId))
        return;
    cancelAutoStore<AMTunerSource>();
    cancelAutoStore<FMTunerSource>();
}

void HardKeyController::requestBeepForStoringPreset()
{
    if (mainIs<Am, Fm, Satellite, WeatherBand>())
        global().requestBeepSound();
}

void HardKeyController::handleHardKeysAtProjection(int keyId, KeyState keyState)
{
    ProjectionSource* const projection = ProjectionSource::instance();
    switch (int(keyState)) {
    case Pressed:
        return projection->projectionButtonPress(keyId);
    case ShortRelease:
        projection->projectionButtonRelease(keyId);
        return projection->projectionButtonLongPress(keyId, false);
    case LongPress:
        return projection->projectionButtonLongPress(keyId, true);
    case LongRelease:
        return projection->projectionButtonRelease(keyId);
    default:
        return;
    }
}

void HardKeyController::handleComboKeysForNativeHmi(int keyId, KeyState keyState)
{
    Rules::applyFirst(Rules::nativeCombinations, *this, {static_cast<unsigned int>(keyId), keyState});
}

void HardKeyController::processSWCSeekDownShortPress()
{
    applyFirst(Rules::wheelSeekDown, *this);
    Q_EMIT swcSeekDownShortPress();
}

void HardKeyController::processSWCSeekUpShortPress()
{
    applyFirst(Rules::wheelSeekUp, *this);
    Q_EMIT swcSeekUpShortPress();
}

void HardKeyController::processSWCSeekDownLongPress()
{
    applyFirst(Rules::wheelSeekDownHeld, *this);
}

void HardKeyController::processSWCSeekUpLongPress()
{
    applyFirst(Rules::wheelSeekUpHeld, *this);
}

void HardKeyController::processSWCSeekDownLongRelease()
{
    applyFirst(Rules::wheelSeekDownReleased, *this);
}

void HardKeyController::processSWCSeekUpLongRelease()
{
    applyFirst(Rules::wheelSeekUpReleased, *this);
}

void HardKeyController::processCombinedSeekLeftKey()
{
    applyFirst(Rules::combinedSeekLeft, *this);
}

void HardKeyController::processCombinedSeekRightKey()
{
    applyFirst(Rules::combinedSeekRight, *this);
}

} // namespace HmiCore
