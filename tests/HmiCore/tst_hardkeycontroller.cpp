// SPDX-License-Identifier: MIT
#include "keyjournal.h"
#include "logcapture.h"

#include <HmiCore/hmicore.h>

#include <QMetaMethod>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QTest>

#include <memory>
#include <optional>

using namespace AL2HMIBridge;
using namespace HmiCore;

namespace {

const QString retune = QStringLiteral("FMTunerSource.tune(\"98.5\", \"-1\")");

QString text(const char* latin1)
{
    return QString::fromLatin1(latin1);
}

} // namespace

class HardKeyControllerTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<BridgeTester> bridge;
    std::optional<KeyJournal> journal;

    /// Sets what "Source.field=value ..." says; words other than numbers are texts.
    static void set(const QString& states)
    {
        const QStringList parts = states.split(QLatin1Char(' '), Qt::SkipEmptyParts);
        for (const QString& part : parts) {
            const QString field = part.section(QLatin1Char('='), 0, 0);
            const QString word = part.section(QLatin1Char('='), 1);
            bool isNumber = false;
            const int number = word.toInt(&isNumber);
            QVariant value = isNumber ? QVariant(number) : QVariant(word);
            if (word == QLatin1String("true") || word == QLatin1String("false"))
                value = word == QLatin1String("true");
            QVERIFY2(BridgeTester::setState(field.section(QLatin1Char('.'), 0, 0),
                                            {{field.section(QLatin1Char('.'), 1), value}}),
                     qPrintable(part));
        }
    }

    QStringList key(int id, int state)
    {
        const bool sent = BridgeTester::sendEvent("KeySource", "keyEvent", {id, state});
        return sent ? journal->take() : QStringList{QStringLiteral("refused")};
    }

private Q_SLOTS:
    void init()
    {
        log.emplace();
        bridge.emplace();
        if (!journal)
            journal.emplace();
        set(text("FMTunerSource.frequency=98.5FM SpeechSource.voiceRecognitionEngineReady=true"));
        BridgeTester::setState("FMTunerSource", {{"frequency", text("98.5")}});
    }
    void cleanup()
    {
        bridge.reset();
        log.reset();
    }
    void cleanupTestCase() { journal.reset(); }

    void theInstanceBelongsToTheApplication()
    {
        HardKeyController* const controller = HardKeyController::instance();
        QCOMPARE(HardKeyController::instance(), controller);
        QCOMPARE(controller->parent(), QCoreApplication::instance());
        QQmlEngine engine;
        QCOMPARE(HardKeyController::hardKeyControllerProvider(&engine, &engine), controller);
        QCOMPARE(QQmlEngine::objectOwnership(controller), QQmlEngine::CppOwnership);
    }

    void theMetaObjectIsThatOfTheContract()
    {
        const QMetaObject& meta = HardKeyController::staticMetaObject;
        QStringList methods;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i)
            methods.append(QString::fromLatin1(meta.method(i).methodSignature()));
        QCOMPARE(methods, QStringList({text("swcSeekDownLongPress()"), text("swcSeekDownLongRelease()"),
                                       text("swcSeekUpLongPress()"), text("swcSeekUpLongRelease()"),
                                       text("swcSeekDownShortPress()"), text("swcSeekUpShortPress()"),
                                       text("onHardKeyReceived(uint32_t,int)"), text("onKeyComboEvent(int,int)")}));
        QCOMPARE(meta.method(meta.methodCount() - 1).access(), QMetaMethod::Private);
        QCOMPARE(meta.method(meta.methodCount() - 2).access(), QMetaMethod::Private);
    }

    void qmlHearsOfTheSteeringWheel()
    {
        registerTypes();
        QQmlEngine engine;
        QQmlComponent component(&engine);
        component.setData("import QtQml 2.15\nimport HmiCore 1.0\nQtObject { id: root; property int steps: 0\n"
                          "property Connections c: Connections { target: HardKeyController\n"
                          "function onSwcSeekUpShortPress() { ++root.steps } } }",
                          QUrl());
        const std::unique_ptr<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        key(89, 2);
        QCOMPARE(object->property("steps").toInt(), 1);
    }

    void everyRow_data()
    {
        QTest::addColumn<QString>("states");
        QTest::addColumn<int>("id");
        QTest::addColumn<int>("state");
        QTest::addColumn<QStringList>("expected");
        const auto row = [](const char* name, const char* states, int id, int state, const QStringList& expected) {
            QTest::newRow(name) << text(states) << id << state << expected;
        };
        const char* const onAm = "GlobalSource.mainAudioSource=0";
        const char* const onFm = "GlobalSource.mainAudioSource=1";
        const char* const onSatellite = "GlobalSource.mainAudioSource=2";
        const char* const onDab = "GlobalSource.mainAudioSource=3";
        const char* const onCd = "GlobalSource.mainAudioSource=4";
        const char* const onMedia = "GlobalSource.mainAudioSource=16";
        const char* const replay = "GlobalSource.mainAudioSource=2 XMTunerSource.replayStatus=1";
        const char* const lostHd = "GlobalSource.mainAudioSource=1 FMTunerSource.hdSignalLossStatus=1";

        row("seek down, FM", onFm, 6, 0, {text("GlobalSource.sendShortSeekDown()")});
        row("seek down released, FM", onFm, 6, 2, {});
        row("seek down, lost HD", lostHd, 6, 0, {retune});
        row("seek up, lost HD", lostHd, 7, 0, {text("GlobalSource.sendShortSeekUp()")});
        row("seek down, AM with lost HD on FM", "GlobalSource.mainAudioSource=0 FMTunerSource.hdSignalLossStatus=1", 6,
            0, {text("GlobalSource.sendShortSeekDown()")});
        row("seek down, live satellite", onSatellite, 6, 0, {text("GlobalSource.sendShortSeekDown()")});
        row("seek down, replay", replay, 6, 0, {});
        row("seek down released, replay", replay, 6, 2, {text("XMTunerSource.seekReverseShort()")});
        row("seek down held, replay", replay, 6, 3, {text("XMTunerSource.seekReverseLong(1)")});
        row("seek down let go, replay", replay, 6, 4, {text("XMTunerSource.seekReverseLong(0)")});
        row("seek up released, replay", replay, 7, 2, {text("XMTunerSource.seekForwardShort()")});
        row("seek up held, replay", replay, 7, 3, {text("XMTunerSource.seekForwardLong(1)")});
        row("seek up let go, replay", replay, 7, 4, {text("XMTunerSource.seekForwardLong(0)")});
        row("seek down, CD", onCd, 6, 0, {});
        row("seek down released, CD", onCd, 6, 2, {text("GlobalSource.sendShortSeekDown()")});
        row("seek up released, DAB", onDab, 7, 2, {text("GlobalSource.sendShortSeekUp()")});
        row("seek up held", onFm, 7, 3, {text("GlobalSource.sendLongSeekUp()")});
        row("seek up let go", onFm, 7, 4, {text("GlobalSource.sendLongReleasedSeekUp()")});
        row("seek, no such state", onFm, 6, 5, {});

        row("volume up", onFm, 8, 0, {text("GlobalSource.systemVolumeSync()")});
        row("volume up held", onFm, 8, 3,
            {text("GlobalSource.sendLongPressedVolumeUpKey()"), text("GlobalSource.systemVolumeSync()")});
        row("volume down released", onFm, 9, 2, {text("GlobalSource.sendShortReleasedVolumeDownKey()")});
        row("volume in valet mode", "ValetModeSource.valetModeEnabled=true", 8, 0, {});
        row("power", onFm, 41, 2, {text("GlobalSource.sendPowerOnOffKeyPressed()")});
        row("power in valet mode", "ValetModeSource.valetModeEnabled=true", 41, 2, {});

        row("source", onFm, 13, 2, {text("GlobalSource.setAudioSource(12, -1)")});
        row("CD", onFm, 15, 2, {text("GlobalSource.setAudioSource(4, -1)")});
        row("satellite band", "XMTunerSource.activePresetBank=1", 47, 2, {text("GlobalSource.setAudioSource(2, 1)")});
        row("mute", onFm, 48, 2, {text("GlobalSource.sendShortReleasedMuteKey()")});
        row("end", onFm, 50, 2, {text("GlobalSource.sendShortEndKey()")});
        row("end, blocked", "EAPhoneSource.eventsBlocked=true", 50, 2, {});

        row("preset 1", onFm, 22, 2, {text("GlobalSource.sendShortPresetKey(1)")});
        row("preset 6", onFm, 27, 2, {text("GlobalSource.sendShortPresetKey(6)")});
        row("no preset 7", onFm, 28, 2, {});
        row("store with beep", onFm, 23, 3,
            {text("GlobalSource.requestBeepSound()"), text("GlobalSource.sendLongPresetKey(2)")});
        row("store, source 5", "GlobalSource.mainAudioSource=5", 23, 3,
            {text("GlobalSource.requestBeepSound()"), text("GlobalSource.sendLongPresetKey(2)")});
        row("store without beep", onCd, 23, 3, {text("GlobalSource.sendLongPresetKey(2)")});

        row("tune up, DAB", onDab, 54, 0, {text("GlobalSource.sendPressedTuneUpKey()")});
        row("tune up, CD", onCd, 54, 1, {text("CDSource.nextTrack()")});
        row("tune up, CD pressed", onCd, 54, 0, {});
        row("tune up, media", onMedia, 54, 0, {});
        row("tune up, lost HD", lostHd, 54, 0, {text("GlobalSource.sendPressedTuneUpKey()")});
        row("tune down, lost HD", lostHd, 55, 0, {retune});
        row("tune down, AM", onAm, 55, 0, {text("GlobalSource.sendPressedTuneDownKey()")});
        row("tune down, CD", onCd, 55, 1, {text("CDSource.previousTrack()")});

        row("display", onFm, 60, 2, {text("intent 64")});
        row("play/pause, CD plays", "GlobalSource.mainAudioSource=4 CDSource.cdStatus=2", 83, 2,
            {text("CDSource.togglePlayPause(3)")});
        row("play/pause, CD pauses", "GlobalSource.mainAudioSource=4 CDSource.cdStatus=3", 83, 2,
            {text("CDSource.togglePlayPause(2)")});
        row("play/pause, CD reads", "GlobalSource.mainAudioSource=4 CDSource.cdStatus=1", 83, 2, {});
        row("play/pause, media", onMedia, 83, 2, {text("MediaAudioSource.togglePlayPause()")});
        row("play/pause, satellite", onSatellite, 83, 2, {text("XMTunerSource.togglePlayPause(1)")});
        row("play/pause, FM", onFm, 83, 2, {});

        row("traffic on FM", onFm, 35, 2, {text("FMTunerSource.toggleTpSeekInProgress(1, true)")});
        row("traffic off on DAB", "GlobalSource.mainAudioSource=3 DABTunerSource.trafficAnnouncementEnabled=true", 35,
            2, {text("DABTunerSource.toggleTpSeekInProgress(3, false)")});
        row("traffic, AM announces", "GlobalSource.mainAudioSource=4 AMTunerSource.announcementType=2", 35, 2,
            {text("AMTunerSource.cancelAnnouncement(2)"), text("intent 52")});
        row("traffic, FM comes first",
            "FMTunerSource.announcementType=1 AMTunerSource.announcementType=2 DABTunerSource.announcementType=3", 35,
            2, {text("FMTunerSource.cancelAnnouncement(1)"), text("intent 52")});

        row("talk", onFm, 10, 2, {text("GlobalSource.sendPressedVoicePTTKey()")});
        row("talk, not ready", "SpeechSource.voiceRecognitionEngineReady=false", 10, 0,
            {text("SpeechSource.voiceRecognitionNotReadyError()")});
        row("talk, not ready but called",
            "SpeechSource.voiceRecognitionEngineReady=false PhoneSource.incomingCall=true", 10, 0, {});
        row("talk, diagnostics", "BezelDiagnosticsSource.bezelDiagnosticsActive=true", 10, 2, {});
        row("talk, assistant listens",
            "PhoneSource.siriSupported=true PhoneSource.siriEnabled=true PhoneSource.siriActive=true", 10, 2,
            {text("PhoneSource.toggleSiriActivation(true)")});
        row("talk held, assistant listens",
            "PhoneSource.siriSupported=true PhoneSource.siriEnabled=true PhoneSource.siriActive=true", 10, 3,
            {text("PhoneSource.toggleSiriActivation(false)")});
        row("talk held, assistant idle", "PhoneSource.siriSupported=true PhoneSource.siriEnabled=true", 10, 3,
            {text("PhoneSource.toggleSiriActivation(true)")});
        row("talk held, assistant off", "PhoneSource.siriSupported=true", 10, 3, {text("intent 47")});
        row("talk held, voice dialling", "PhoneSource.phoneVoiceServiceActive=true", 10, 3,
            {text("PhoneSource.togglePhoneVoiceServiceActivation(false)")});
        row("talk held, voice session", "PhoneSource.phoneVoiceServiceActive=true SpeechSource.sessionState=1", 10, 3,
            {text("GlobalSource.sendLongPressedVoicePTTKey()")});

        row("cancelled by an unknown key", "SpeechSource.sessionState=1", 200, 0,
            {text("SpeechSource.cancelVRSession()")});
        row("not by its release", "SpeechSource.sessionState=1", 200, 2, {});
        row("not by talk", "SpeechSource.sessionState=1", 10, 0, {});
        row("spoken text by talk", "SpeechSource.ttsSessionActive=true", 10, 0,
            {text("SpeechSource.cancelTTSSession()")});
        row("spoken text not by volume", "SpeechSource.ttsSessionActive=true", 9, 0,
            {text("GlobalSource.systemVolumeSync()")});
        row("both autostores, session first",
            "AMTunerSource.autoStoreInProgress=true FMTunerSource.autoStoreInProgress=true SpeechSource.sessionState=1 "
            "SpeechSource.ttsSessionActive=true",
            77, 0,
            {text("SpeechSource.cancelVRSession()"), text("SpeechSource.cancelTTSSession()"),
             text("AMTunerSource.sendAutoStoreCancel()"), text("FMTunerSource.sendAutoStoreCancel()")});

        row("talk goes to the phone", "ProjectionSource.projectionMode=1 SpeechSource.sessionState=1", 10, 0,
            {text("ProjectionSource.projectionButtonPress(10)")});
        row("short release at the phone", "ProjectionSource.projectionMode=1", 12, 2,
            {text("ProjectionSource.projectionButtonRelease(12)"),
             text("ProjectionSource.projectionButtonLongPress(12, false)")});
        row("held at the phone", "ProjectionSource.projectionMode=1", 49, 3,
            {text("ProjectionSource.projectionButtonLongPress(49, true)")});
        row("long release at the phone", "ProjectionSource.projectionMode=1", 79, 4,
            {text("ProjectionSource.projectionButtonRelease(79)")});
        row("blocked at the phone", "ProjectionSource.projectionMode=1 EAPhoneSource.eventsBlocked=true", 80, 2, {});
        row("seek stays without its sound", "ProjectionSource.projectionMode=1 GlobalSource.mainAudioSource=1", 6, 0,
            {text("GlobalSource.sendShortSeekDown()")});
        row("seek goes with its sound", "ProjectionSource.projectionMode=1 GlobalSource.mainAudioSource=35", 6, 0,
            {text("ProjectionSource.projectionButtonPress(6)")});
        row("combined key stays", "ProjectionSource.projectionMode=1 GlobalSource.mainAudioSource=1", 78, 2,
            {text("GlobalSource.sendShortSeekUp()")});
        row("combined key, lost HD",
            "ProjectionSource.projectionMode=1 GlobalSource.mainAudioSource=1 "
            "FMTunerSource.hdSignalLossStatus=1",
            77, 2, {retune});
        row("combined key, private call",
            "ProjectionSource.projectionMode=1 PhoneSource.callConnected=true PhoneSource.privateMode=true "
            "GlobalSource.mainAudioSource=16",
            91, 2, {text("MediaAudioSource.next()"), text("signal swcSeekUpShortPress")});
        row("combined key, call", "ProjectionSource.projectionMode=1 PhoneSource.callConnected=true", 91, 0,
            {text("ProjectionSource.projectionButtonPress(91)")});
        row("combined key without projection", onFm, 91, 2, {});
        row("key 92 during projection", "ProjectionSource.projectionMode=1", 92, 2, {});

        row("wheel down, first of the bank", "GlobalSource.mainAudioSource=1 FMTunerSource.activePreset=1", 88, 2,
            {text("FMTunerSource.recallPreset(1, 6)"), text("signal swcSeekDownShortPress")});
        row("wheel up, last of the bank", "GlobalSource.mainAudioSource=0 AMTunerSource.activePreset=6", 89, 2,
            {text("AMTunerSource.recallPreset(0, 1)"), text("signal swcSeekUpShortPress")});
        row("wheel up, above the bank", "GlobalSource.mainAudioSource=3 DABTunerSource.activePreset=9", 89, 2,
            {text("DABTunerSource.recallPreset(3, 10)"), text("signal swcSeekUpShortPress")});
        row("wheel down, other bank",
            "GlobalSource.mainAudioSource=2 XMTunerSource.activePreset=0 XMTunerSource.activePresetBank=2", 88, 2,
            {text("XMTunerSource.recallPreset(2, 6)"), text("signal swcSeekDownShortPress")});
        row("wheel up, other bank",
            "GlobalSource.mainAudioSource=2 XMTunerSource.activePreset=0 XMTunerSource.activePresetBank=2", 89, 2,
            {text("XMTunerSource.recallPreset(2, 1)"), text("signal swcSeekUpShortPress")});
        row("wheel down, lost HD", lostHd, 88, 2, {retune, text("signal swcSeekDownShortPress")});
        row("wheel down, unknown source", "GlobalSource.mainAudioSource=12", 88, 2,
            {text("signal swcSeekDownShortPress")});
        row("wheel down held, replay", replay, 88, 3, {text("XMTunerSource.seekReverseLong(1)")});
        row("wheel down held", onFm, 88, 3,
            {text("GlobalSource.sendLongSeekDown()"), text("signal swcSeekDownLongPress")});
        row("wheel up let go", onFm, 89, 4,
            {text("GlobalSource.sendLongReleasedSeekUp()"), text("signal swcSeekUpLongRelease")});
        row("wheel pressed", onFm, 88, 0, {});
    }

    void everyRow()
    {
        QFETCH(QString, states);
        QFETCH(int, id);
        QFETCH(int, state);
        set(states);
        QTEST(key(id, state), "expected");
    }

    void combinationSevenCollectsLogs()
    {
        for (int combination = 0; combination < 12; ++combination) {
            for (int state = 0; state < 8; ++state) {
                QVERIFY(BridgeTester::sendEvent("KeySource", "keyComboEvent", {combination, state}));
                const bool isSeven = combination == 7 && state == 5;
                QCOMPARE(journal->take(),
                         isSeven ? QStringList{text("GlobalSource.captureSystemLogs()")} : QStringList());
            }
        }
    }

    /// Before the first state has come, keys find the sources at their defaults.
    void keysBeforeTheSnapshot()
    {
        BridgeTester::resetState();
        for (int id = 0; id <= 100; ++id)
            for (int state = 0; state <= 5; ++state)
                key(id, state);
        QCOMPARE(key(6, 0), QStringList()); // no source plays
        QCOMPARE(key(8, 2), {text("GlobalSource.sendShortReleasedVolumeUpKey()")});
    }

    void performanceMarkersComeFirst()
    {
        log.reset();
        log.emplace(text("kest.performance.debug=true\n*performance*.debug=true\nkest.hmicore.decisions.debug=true"));
        key(200, 9);
        QStringList lines;
        const auto records = log->records();
        for (const LogCapture::Record& record : records)
            lines.append(record.message);
        QCOMPARE(lines.size(), 3);
        QCOMPARE(lines.at(0),
                 text("P12.R060.01, P12.R061.01, P12.R062.01 - Screen transition: Start Marker - Hardkey Button."));
        QCOMPARE(lines.at(1), text("P12.R056.01 - Changes to Visible state by Hard key: Start Marker"));
        QVERIFY2(lines.at(2).startsWith(text("key 200 state 9: nothing; saw ")), qPrintable(lines.at(2)));
    }
};

QTEST_GUILESS_MAIN(HardKeyControllerTest)
#include "tst_hardkeycontroller.moc"
