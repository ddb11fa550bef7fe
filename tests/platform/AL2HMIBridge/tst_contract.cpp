// SPDX-License-Identifier: MIT
#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/BezelDiagnosticsSource>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/EAPhoneSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/HMI2ALMessageSender>
#include <AL2HMIBridge/HMI2NAVMessageSender>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/LanguageModel>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/MessageReceivePriorityQueueThread>
#include <AL2HMIBridge/MessageReceiveThread>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/ProjectionSource>
#include <AL2HMIBridge/SpeechSource>
#include <AL2HMIBridge/TouchInputReceiverThread>
#include <AL2HMIBridge/TunerSource>
#include <AL2HMIBridge/ValetModeSource>
#include <AL2HMIBridge/XMTunerSource>

#include <QTest>

#include <type_traits>

using namespace AL2HMIBridge;

// The signatures that code written against any platform relies on; a wrong one does not compile.

template <class Class>
constexpr bool isSource = std::is_base_of_v<QObject, Class>&& std::is_same_v<decltype(Class::instance()), Class*>;
template <class Enum>
constexpr bool isIntEnum =
    std::is_enum_v<Enum>&& std::is_same_v<std::underlying_type_t<Enum>, int>&& std::is_convertible_v<Enum, int>;

#define GETTER(Class, Type, name) static_assert(std::is_same_v<decltype(&Class::name), Type (Class::*)() const>)
#define CALL(Class, name, arguments) static_assert(std::is_same_v<decltype(&Class::name), void(Class::*) arguments>)

static_assert(isSource<KeySource> && isSource<GlobalSource> && isSource<SpeechSource> && isSource<PhoneSource>);
static_assert(
    isSource<EAPhoneSource> && isSource<ProjectionSource> && isSource<CDSource> && isSource<MediaAudioSource>);
static_assert(isSource<ValetModeSource> && isSource<BezelDiagnosticsSource> && isSource<LanguageModel>);
static_assert(
    isSource<AMTunerSource> && isSource<FMTunerSource> && isSource<XMTunerSource> && isSource<DABTunerSource>);
static_assert(std::is_base_of_v<TunerSource, AMTunerSource> && std::is_base_of_v<TunerSource, FMTunerSource>);
static_assert(std::is_base_of_v<TunerSource, XMTunerSource> && std::is_base_of_v<TunerSource, DABTunerSource>);
static_assert(
    isIntEnum<
        KeySource::KeyState> && isIntEnum<GlobalSource::ALAudioSource> && isIntEnum<GlobalSource::SystemLanguage>);
static_assert(
    isIntEnum<TunerSource::CurrentMode> && isIntEnum<XMTunerSource::SeekLongXMStatus> && isIntEnum<CDSource::CDStatus>);

static_assert(std::is_same_v<decltype(&MessageReceiveThread::createInstance), MessageReceiveThread* (*)(QObject*)>);
static_assert(std::is_same_v<decltype(&MessageReceivePriorityQueueThread::createInstance),
                             MessageReceivePriorityQueueThread* (*)(QObject*)>);
static_assert(
    std::is_base_of_v<QThread, MessageReceiveThread> && std::is_base_of_v<QThread, MessageReceivePriorityQueueThread>);
static_assert(std::is_base_of_v<
                  QThread, TouchInputReceiverThread> && std::is_constructible_v<TouchInputReceiverThread, QObject*>);
static_assert(std::is_void_v<decltype(std::declval<MessageReceiveThread&>().begin())>);
static_assert(std::is_void_v<decltype(std::declval<MessageReceivePriorityQueueThread&>().begin())>);
static_assert(std::is_void_v<decltype(std::declval<TouchInputReceiverThread&>().begin())>);
CALL(TouchInputReceiverThread, setPassThroughViewVisible, (bool));
CALL(TouchInputReceiverThread, setMobileNavTouchParamsOffset, (bool, int, int));
CALL(TouchInputReceiverThread, passThroughViewTouched, ());
static_assert(
    std::is_pointer_v<
        decltype(HMI2ALMessageSender::instance())> && std::is_pointer_v<decltype(HMI2NAVMessageSender::instance())>);

CALL(KeySource, keyEvent, (int, int));
CALL(KeySource, keyComboEvent, (int, int));

GETTER(GlobalSource, GlobalSource::ALAudioSource, mainAudioSource);
GETTER(GlobalSource, int, destinationCountry);
CALL(GlobalSource, setAudioSource, (GlobalSource::ALAudioSource, int));
CALL(GlobalSource, systemVolumeSync, ());
CALL(GlobalSource, sendShortSeekDown, ());
CALL(GlobalSource, sendShortSeekUp, ());
CALL(GlobalSource, sendLongSeekDown, ());
CALL(GlobalSource, sendLongSeekUp, ());
CALL(GlobalSource, sendLongReleasedSeekDown, ());
CALL(GlobalSource, sendLongReleasedSeekUp, ());
CALL(GlobalSource, sendShortReleasedVolumeUpKey, ());
CALL(GlobalSource, sendShortReleasedVolumeDownKey, ());
CALL(GlobalSource, sendLongPressedVolumeUpKey, ());
CALL(GlobalSource, sendLongPressedVolumeDownKey, ());
CALL(GlobalSource, sendLongReleasedVolumeUpKey, ());
CALL(GlobalSource, sendLongReleasedVolumeDownKey, ());
CALL(GlobalSource, sendPressedTuneUpKey, ());
CALL(GlobalSource, sendPressedTuneDownKey, ());
CALL(GlobalSource, sendLongPressedTuneUpKey, ());
CALL(GlobalSource, sendLongPressedTuneDownKey, ());
CALL(GlobalSource, sendLongReleasedTuneUpKey, ());
CALL(GlobalSource, sendLongReleasedTuneDownKey, ());
CALL(GlobalSource, sendPressedVoicePTTKey, ());
CALL(GlobalSource, sendLongPressedVoicePTTKey, ());
CALL(GlobalSource, sendShortPresetKey, (int));
CALL(GlobalSource, sendLongPresetKey, (int));
CALL(GlobalSource, sendPowerOnOffKeyPressed, ());
CALL(GlobalSource, sendShortReleasedMuteKey, ());
CALL(GlobalSource, sendShortEndKey, ());
CALL(GlobalSource, requestBeepSound, ());
CALL(GlobalSource, captureSystemLogs, ());

GETTER(SpeechSource, int, sessionState);
GETTER(SpeechSource, bool, ttsSessionActive);
CALL(SpeechSource, cancelVRSession, ());
CALL(SpeechSource, cancelTTSSession, ());
GETTER(SpeechSource, bool, voiceRecognitionEngineReady);
CALL(SpeechSource, voiceRecognitionNotReadyError, ());

GETTER(PhoneSource, bool, incomingCall);
GETTER(PhoneSource, bool, callConnected);
GETTER(PhoneSource, bool, privateMode);
GETTER(PhoneSource, bool, siriSupported);
GETTER(PhoneSource, bool, siriEnabled);
GETTER(PhoneSource, bool, siriActive);
CALL(PhoneSource, toggleSiriActivation, (bool));
GETTER(PhoneSource, bool, phoneVoiceServiceActive);
CALL(PhoneSource, togglePhoneVoiceServiceActivation, (bool));
GETTER(EAPhoneSource, bool, eventsBlocked);

GETTER(ProjectionSource, int, projectionMode);
GETTER(ProjectionSource, int, dioCallStatus);
CALL(ProjectionSource, projectionButtonPress, (int));
CALL(ProjectionSource, projectionButtonRelease, (int));
CALL(ProjectionSource, projectionButtonLongPress, (int, bool));

GETTER(TunerSource, QString, frequency);
CALL(TunerSource, tune, (const QString&, const QString&));
GETTER(TunerSource, bool, autoStoreInProgress);
CALL(TunerSource, sendAutoStoreCancel, ());
GETTER(TunerSource, int, announcementType);
CALL(TunerSource, cancelAnnouncement, (int));
GETTER(TunerSource, bool, trafficAnnouncementEnabled);
CALL(TunerSource, toggleTpSeekInProgress, (TunerSource::CurrentMode, bool));
GETTER(TunerSource, int, activePreset);
GETTER(TunerSource, int, activePresetBank);
CALL(TunerSource, recallPreset, (TunerSource::CurrentMode, int));
GETTER(FMTunerSource, int, hdSignalLossStatus);
GETTER(XMTunerSource, int, replayStatus);
CALL(XMTunerSource, seekForwardShort, ());
CALL(XMTunerSource, seekReverseShort, ());
CALL(XMTunerSource, seekForwardLong, (XMTunerSource::SeekLongXMStatus));
CALL(XMTunerSource, seekReverseLong, (XMTunerSource::SeekLongXMStatus));
GETTER(XMTunerSource, int, playStatus);
CALL(XMTunerSource, togglePlayPause, (int));

GETTER(CDSource, CDSource::CDStatus, cdStatus);
CALL(CDSource, togglePlayPause, (CDSource::CDStatus));
CALL(CDSource, nextTrack, ());
CALL(CDSource, previousTrack, ());
CALL(MediaAudioSource, togglePlayPause, ());
CALL(MediaAudioSource, next, ());
CALL(MediaAudioSource, previous, ());
GETTER(ValetModeSource, bool, valetModeEnabled);
GETTER(BezelDiagnosticsSource, bool, bezelDiagnosticsActive);

static_assert(std::is_base_of_v<QAbstractListModel, LanguageModel>);
static_assert(std::is_same_v<decltype(&LanguageModel::languageSupported),
                             bool (LanguageModel::*)(GlobalSource::SystemLanguage) const>);
static_assert(std::is_same_v<decltype(&LanguageModel::localeFromId),
                             QString (LanguageModel::*)(GlobalSource::SystemLanguage) const>);
static_assert(std::is_same_v<decltype(&LanguageModel::idForLocale), int (LanguageModel::*)(const QString&) const>);

/// The numbers that other sides know without names.
class ContractTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void numbersAreFixed()
    {
        QCOMPARE(int(GlobalSource::AudioAM), 0);
        QCOMPARE(int(GlobalSource::AudioFM), 1);
        QCOMPARE(int(GlobalSource::AudioXM), 2);
        QCOMPARE(int(GlobalSource::AudioDAB), 3);
        QCOMPARE(int(GlobalSource::AudioCD), 4);
        QCOMPARE(int(GlobalSource::AudioMedia), 16);
        QCOMPARE(int(GlobalSource::AudioProjectionWired), 34);
        QCOMPARE(int(GlobalSource::AudioProjectionWireless), 35);
        QCOMPARE(int(TunerSource::ModeAM), int(GlobalSource::AudioAM));
        QCOMPARE(int(TunerSource::ModeFM), int(GlobalSource::AudioFM));
        QCOMPARE(int(TunerSource::ModeXM), int(GlobalSource::AudioXM));
        QCOMPARE(int(TunerSource::ModeDAB), int(GlobalSource::AudioDAB));
        QCOMPARE(int(KeySource::KeyPressed), 0);
        QCOMPARE(int(KeySource::KeyShortReleased), 2);
        QCOMPARE(int(KeySource::KeyLongPressed), 3);
        QCOMPARE(int(KeySource::KeyLongReleased), 4);
        QCOMPARE(int(KeySource::KeyCombined), 5);
        QCOMPARE(int(CDSource::CDPlaying), 2);
        QCOMPARE(int(CDSource::CDPaused), 3);
        QCOMPARE(int(XMTunerSource::SeekLongStop), 0);
        QCOMPARE(int(XMTunerSource::SeekLongStart), 1);
    }
};

QTEST_GUILESS_MAIN(ContractTest)
#include "tst_contract.moc"
