// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentMonitor>
#include <HmiGuiFramework/StatusBarController>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/StateMachine>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiIntentManager;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::StateMachine;

/// What lies over the modules' screens, and the intents with which it and the modules are asked for something.
class SystemScreensTest : public QObject
{
    Q_OBJECT

    static QString text(const char* utf8) { return QString::fromUtf8(utf8); }

    static bool open(const char* view) { return Screen::views()->requestView(text(view)) && Screen::shows(view); }

    static bool popup(const char* name)
    {
        return QTest::qWaitFor([name] { return Screen::views()->currentPopup() == text(name); })
               && (*name == '\0' || Screen::isDrawn());
    }

    static bool request(int intent, const QList<QVariant>& data = {})
    {
        return HmiIntentManager::instance()->requestAction(intent, data);
    }

    static bool isEnabled(int intent) { return HmiIntentManager::instance()->intentMonitor(intent)->enabled(); }

    static QString transient()
    {
        return HmiGuiFramework::DataStore::get<HmiGuiFramework::StatusBarController>(text("StatusBarController"))
            ->transient();
    }

    /// The calls that left, once there is one.
    static QStringList nextCalls()
    {
        const bool came = QTest::qWaitFor([] { return !BridgeTester::calls().isEmpty(); });
        return came ? BridgeTester::takeCalls() : QStringList();
    }

    /// The request fails with its two warnings, and the driver is told why.
    bool failsWith(int intent, const QList<QVariant>& data, const char* reason)
    {
        if (request(intent, data) || m_log->take(text("kest.hmicore"), QtWarningMsg).size() != 1)
            return false;
        return QTest::qWaitFor([reason] { return Screen::text("noticeText") == text(reason); });
    }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        StateMachine::instance()->sendKeySignal(text("Home"));
        QCoreApplication::processEvents();
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        QVERIFY(popup(""));
        for (auto* const module : StateMachine::instance()->findChildren<HmiLayeredState*>())
            module->reset();
        HmiGuiFramework::DataStore::get<HmiGuiFramework::StatusBarController>(text("StatusBarController"))
            ->dismissTransient();
        BridgeTester::takeCalls();
    }

    void cleanup()
    {
        m_vehicle.reset();
        m_log.reset();
    }

    void theStandbyScreenIsLeftWithATouchAndWithEveryKey()
    {
        BridgeTester::setState("GlobalSource", {{"clockText", text("10:42")}, {"powerOn", false}});
        QVERIFY(popup("SYSTEM.Standby"));
        QCOMPARE(Screen::text("standbyClock"), text("10:42"));
        QTest::mouseClick(Screen::window(), Qt::LeftButton, Qt::NoModifier, QPoint(50, 50));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("GlobalSource.sendPowerOnOffKeyPressed()")});
        BridgeTester::sendEvent("KeySource", "keyEvent", {200, 0});
        BridgeTester::sendEvent("KeySource", "keyEvent", {200, 2});
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("GlobalSource.sendPowerOnOffKeyPressed()")});
        // The power key does so by itself when it comes up.
        BridgeTester::sendEvent("KeySource", "keyEvent", {41, 0});
        BridgeTester::sendEvent("KeySource", "keyEvent", {41, 2});
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("GlobalSource.sendPowerOnOffKeyPressed()")});
        BridgeTester::setState("GlobalSource", {{"powerOn", true}});
        QVERIFY(popup(""));
        BridgeTester::sendEvent("KeySource", "keyEvent", {200, 0});
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
    }

    void theDisplayKeyDarkensTheScreenAndATouchLightsIt()
    {
        QVERIFY(open("RADIO.Main"));
        BridgeTester::sendEvent("KeySource", "keyEvent", {60, 2});
        QVERIFY(popup("SYSTEM.DisplayOff"));
        BridgeTester::sendEvent("KeySource", "keyEvent", {60, 2});
        QVERIFY(popup(""));
        QVERIFY(request(HmiIntentManager::RequestDisplayOff));
        QVERIFY(popup("SYSTEM.DisplayOff"));
        BridgeTester::takeCalls();
        QTest::mouseClick(Screen::window(), Qt::LeftButton, Qt::NoModifier,
                          Screen::find("seekUp")->mapToScene(QPointF(20, 20)).toPoint());
        QVERIFY(popup(""));
        QCOMPARE(BridgeTester::takeCalls(), QStringList()); // what lies beneath is not touched
        QCOMPARE(Screen::views()->currentView(), text("RADIO.Main"));
    }

    void aCallLightsTheDisplay()
    {
        QVERIFY(request(HmiIntentManager::RequestDisplayOff));
        QVERIFY(popup("SYSTEM.DisplayOff"));
        BridgeTester::setState("PhoneSource", {{"incomingCall", true}});
        QVERIFY(popup("PHONE.IncomingCall"));
        BridgeTester::setState("PhoneSource", {{"incomingCall", false}});
        QVERIFY(popup(""));
    }

    void valetModeHidesEverythingAndHasAWayOut()
    {
        QVERIFY(isEnabled(HmiIntentManager::EnterValetMode));
        QVERIFY(open("SETTINGS.Main"));
        QVERIFY(Screen::tap("page4"));
        QCOMPARE(nextCalls(), QStringList{text("ValetModeSource.setValetMode(true)")});
        BridgeTester::setState("ValetModeSource", {{"valetModeEnabled", true}});
        QVERIFY(popup("SYSTEM.Valet"));
        QVERIFY(!isEnabled(HmiIntentManager::EnterValetMode));
        QVERIFY(!Screen::find("page4")->property("active").toBool());
        QVERIFY(!Screen::find("transient"));
        BridgeTester::setState("PhoneSource", {{"incomingCall", true}});
        QCoreApplication::processEvents();
        QCOMPARE(Screen::views()->currentPopup(), text("SYSTEM.Valet"));
        BridgeTester::setState("PhoneSource", {{"incomingCall", false}});
        QVERIFY(Screen::tap("leaveValet"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("ValetModeSource.setValetMode(false)")});
        BridgeTester::setState("ValetModeSource", {{"valetModeEnabled", false}});
        QVERIFY(popup(""));
        QCOMPARE(Screen::views()->currentView(), text("SETTINGS.Main"));
    }

    void theVoiceSessionShowsItsPromptAndStep()
    {
        BridgeTester::setState("SpeechSource", {{"voiceRecognitionEngineReady", true},
                                                {"sessionState", 2},
                                                {"promptText", text("Whom do you want to call?")}});
        QVERIFY(popup("SYSTEM.Voice"));
        QCOMPARE(Screen::text("voicePrompt"), text("Whom do you want to call?"));
        QCOMPARE(Screen::find("voiceStep")->property("text").toString(), text("Step 2"));
        QVERIFY(Screen::tap("cancelVoice"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("SpeechSource.cancelVRSession()")});
        BridgeTester::setState("SpeechSource", {{"sessionState", 0}, {"ttsSessionActive", true}});
        QCOMPARE(Screen::text("voiceTitle"), text("Spoken message"));
        QVERIFY(Screen::tap("cancelVoice"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("SpeechSource.cancelTTSSession()")});
        BridgeTester::setState("SpeechSource", {{"voiceRecognitionEngineReady", false}});
        QCOMPARE(Screen::text("voiceTitle"), text("Voice control is not ready"));
        BridgeTester::setState("SpeechSource", {{"ttsSessionActive", false}});
        QVERIFY(popup(""));
    }

    void theVolumeShownIsThatOfTheVoiceWhileOneIsHeard()
    {
        BridgeTester::setState("GlobalSource", {{"volume", 11}});
        HmiGuiFramework::DataStore::get<HmiGuiFramework::StatusBarController>(text("StatusBarController"))
            ->requestTransientWidget(text("SYSTEM.Volume"), 60000);
        QTRY_COMPARE(Screen::text("volumeText"), text("11"));
        BridgeTester::setState("GlobalSource", {{"voiceVolume", 25}});
        QCOMPARE(Screen::text("volumeText"), text("11"));
        BridgeTester::setState("SpeechSource", {{"sessionState", 1}});
        QVERIFY(popup("SYSTEM.Voice"));
        QCOMPARE(Screen::text("volumeText"), text("25"));
    }

    void theTrafficAnnouncementOfEveryTunerIsShownAndCancelled_data()
    {
        QTest::addColumn<QByteArray>("tuner");
        QTest::addColumn<QString>("band");
        QTest::newRow("FM") << QByteArray("FMTunerSource") << text("FM · Harbour");
        QTest::newRow("AM") << QByteArray("AMTunerSource") << text("AM · Harbour");
        QTest::newRow("DAB") << QByteArray("DABTunerSource") << text("DAB · Harbour");
    }

    void theTrafficAnnouncementOfEveryTunerIsShownAndCancelled()
    {
        QFETCH(QByteArray, tuner);
        QFETCH(QString, band);
        QVERIFY(open("SETTINGS.Main"));
        QVERIFY(!isEnabled(HmiIntentManager::CancelAnnouncement));
        BridgeTester::setState(tuner.constData(), {{"announcementType", 3},
                                                   {"stationName", text("Harbour")},
                                                   {"announcementText", text("A1: stones on the road")}});
        QVERIFY(popup("RADIO.Announcement"));
        QVERIFY(isEnabled(HmiIntentManager::CancelAnnouncement));
        QCOMPARE(Screen::text("announcer"), band);
        QCOMPARE(Screen::text("announcementText"), text("A1: stones on the road"));
        QVERIFY(Screen::tap("cancelAnnouncement"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QString::fromLatin1(tuner) + text(".cancelAnnouncement(3)")});
        QVERIFY(popup("")); // at once, whatever the tuner does
        BridgeTester::setState(tuner.constData(), {{"announcementType", 0}});
        BridgeTester::setState(tuner.constData(), {{"announcementType", 1}});
        QVERIFY(popup("RADIO.Announcement"));
        BridgeTester::sendEvent("KeySource", "keyEvent", {35, 2});
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QString::fromLatin1(tuner) + text(".cancelAnnouncement(1)")});
        QVERIFY(popup(""));
        BridgeTester::setState(tuner.constData(), {{"announcementType", 0}});
        BridgeTester::setState(tuner.constData(), {{"announcementType", 2}});
        QVERIFY(popup("RADIO.Announcement"));
        BridgeTester::setState(tuner.constData(), {{"announcementType", 0}}); // by itself
        QVERIFY(popup(""));
    }

    void aProjectedPhoneHasAScreenForAsLongAsItIsThere()
    {
        QVERIFY(!Screen::find("railProjection"));
        QVERIFY(!isEnabled(HmiIntentManager::ShowProjection));
        QVERIFY(failsWith(HmiIntentManager::ShowProjection, {}, "No phone is projected"));
        BridgeTester::setState("ProjectionSource", {{"projectionMode", 1}, {"projectedDeviceName", text("A phone")}});
        QVERIFY(isEnabled(HmiIntentManager::ShowProjection));
        QVERIFY(Screen::tap("railProjection"));
        QVERIFY(Screen::shows("SYSTEM.Projection"));
        QCOMPARE(Screen::text("projectedDevice"), text("A phone"));
        QVERIFY(!Screen::find("projectedCall"));
        BridgeTester::setState("ProjectionSource", {{"dioCallStatus", 1}});
        QVERIFY(Screen::find("projectedCall"));
        BridgeTester::setState("ProjectionSource", {{"projectionMode", 0}});
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
    }

    void callsAreOnlyOfferedWhenOneCanBeMade_data()
    {
        QTest::addColumn<QString>("source");
        QTest::addColumn<QString>("field");
        QTest::addColumn<QVariant>("value");
        QTest::addColumn<QByteArray>("reason");
        QTest::newRow("no phone") << text("PhoneSource") << text("deviceName") << QVariant(QString())
                                  << QByteArray("No phone is connected");
        QTest::newRow("call") << text("PhoneSource") << text("callConnected") << QVariant(true)
                              << QByteArray("A call is running");
        QTest::newRow("dialling") << text("PhoneSource") << text("dialling") << QVariant(true)
                                  << QByteArray("A call is running");
        QTest::newRow("ringing") << text("PhoneSource") << text("incomingCall") << QVariant(true)
                                 << QByteArray("A call is running");
        QTest::newRow("emergency") << text("EAPhoneSource") << text("eventsBlocked") << QVariant(true)
                                   << QByteArray("An emergency call is running");
    }

    void callsAreOnlyOfferedWhenOneCanBeMade()
    {
        QFETCH(QString, source);
        QFETCH(QString, field);
        QFETCH(QVariant, value);
        QFETCH(QByteArray, reason);
        const QVariant contact = QVariantMap{{text("name"), text("Ada")}, {text("number"), text("123")}};
        BridgeTester::setState("PhoneSource", {{"deviceName", text("A phone")}, {"contacts", QVariantList{contact}}});
        QVERIFY(isEnabled(HmiIntentManager::MakePhoneCall));
        QVERIFY(open("PHONE.Main"));
        QVERIFY(Screen::find("contact0")->property("active").toBool());
        QVERIFY(Screen::tap("contact0"));
        QCOMPARE(nextCalls(), QStringList{text("PhoneSource.dial(\"123\")")});

        BridgeTester::setState(source, {{field, value}});
        QVERIFY(!isEnabled(HmiIntentManager::MakePhoneCall));
        QVERIFY(failsWith(HmiIntentManager::MakePhoneCall, {text("123")}, reason.constData()));
        BridgeTester::resetState();
        QVERIFY(popup(""));
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
    }

    void anEmergencyCallIsShownAndKeepsThePhoneAway()
    {
        BridgeTester::setState("PhoneSource", {{"deviceName", text("A phone")}, {"callConnected", true}});
        BridgeTester::setState("EAPhoneSource", {{"eventsBlocked", true}});
        QVERIFY(Screen::shows("PHONE.Call"));
        QVERIFY(Screen::find("emergencyNote") && Screen::find("statusEmergency"));
        QVERIFY(!Screen::find("hangUp")->property("active").toBool());
        QVERIFY(open("PHONE.Main"));
        QVERIFY(!Screen::find("openKeypad")->property("active").toBool());
        BridgeTester::setState("EAPhoneSource", {{"eventsBlocked", false}});
        QVERIFY(!Screen::find("emergencyNote") && !Screen::find("statusEmergency"));
    }

    void theCallGoesOnInTheStatusBar()
    {
        BridgeTester::setState("PhoneSource", {{"callConnected", true}, {"callDuration", 3725}});
        QVERIFY(Screen::shows("PHONE.Call"));
        QVERIFY(!Screen::find("callChip"));
        QCOMPARE(Screen::text("callState"), text("1:02:05"));
        QCOMPARE(Screen::text("caller"), text("Unknown caller"));
        QVERIFY(!Screen::find("privateNote"));
        BridgeTester::setState("PhoneSource", {{"privateMode", true}});
        QVERIFY(Screen::find("privateNote"));
        QVERIFY(open("RADIO.Main"));
        QCOMPARE(Screen::text("callChip"), text("1:02:05"));
        QVERIFY(Screen::tap("callChip"));
        QVERIFY(Screen::shows("PHONE.Call"));
        BridgeTester::setState("PhoneSource", {{"callConnected", false}});
    }

    void theAssistantIsShownWhileItListensAndExplainedWhenItIsOff()
    {
        BridgeTester::setState("PhoneSource", {{"siriActive", true}});
        QVERIFY(popup("PHONE.Assistant"));
        QVERIFY(Screen::tap("stopAssistant"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("PhoneSource.toggleSiriActivation(false)")});
        BridgeTester::setState("PhoneSource", {{"siriActive", false}, {"phoneVoiceServiceActive", true}});
        QVERIFY(Screen::tap("stopAssistant"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("PhoneSource.togglePhoneVoiceServiceActivation(false)")});
        BridgeTester::setState("PhoneSource", {{"phoneVoiceServiceActive", false}, {"siriSupported", true}});
        QVERIFY(popup(""));

        BridgeTester::setState("SpeechSource", {{"voiceRecognitionEngineReady", true}});
        BridgeTester::sendEvent("KeySource", "keyEvent", {10, 3});
        QVERIFY(popup("PHONE.AssistantHint"));
        QVERIFY(Screen::tap("dismissPopup"));
        QVERIFY(popup(""));
        BridgeTester::setState("PhoneSource", {{"siriEnabled", true}});
        QVERIFY(!isEnabled(HmiIntentManager::PhoneSiriNotEnabled));
    }

    void whatPlaysIsSuspendedAndResumed()
    {
        BridgeTester::setState("MediaAudioSource", {{"title", text("Neon Rain")}, {"playing", true}});
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}});
        QVERIFY(!isEnabled(HmiIntentManager::SuspendMediaPlayback)
                && !isEnabled(HmiIntentManager::ResumeMediaPlayback));
        QVERIFY(failsWith(HmiIntentManager::SuspendMediaPlayback, {}, "No player is heard"));
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 16}});
        QVERIFY(isEnabled(HmiIntentManager::SuspendMediaPlayback) && !isEnabled(HmiIntentManager::ResumeMediaPlayback));
        QVERIFY(Screen::tap("nowPlayingPause"));
        QCOMPARE(nextCalls(), QStringList{text("MediaAudioSource.togglePlayPause()")});
        BridgeTester::setState("MediaAudioSource", {{"playing", false}});
        QVERIFY(!isEnabled(HmiIntentManager::SuspendMediaPlayback) && isEnabled(HmiIntentManager::ResumeMediaPlayback));
        QVERIFY(Screen::tap("nowPlayingPause"));
        QCOMPARE(nextCalls(), QStringList{text("MediaAudioSource.togglePlayPause()")});
        BridgeTester::setState("CDSource", {{"cdStatus", 0}});
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 4}});
        QVERIFY(!Screen::find("nowPlayingPause")->property("active").toBool());
    }

    void theScreenOfWhatIsHeardIsShown()
    {
        QVERIFY(!isEnabled(HmiIntentManager::ShowCurrentAudioPrimary));
        QVERIFY(failsWith(HmiIntentManager::ShowCurrentAudioPrimary, {}, "Nothing plays"));
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 3}});
        QVERIFY(request(HmiIntentManager::ShowCurrentAudioPrimary));
        QVERIFY(Screen::shows("RADIO.Main"));
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 4}});
        QVERIFY(request(HmiIntentManager::ShowCurrentAudioPrimary));
        QVERIFY(Screen::shows("MEDIA.Main"));
    }

    void theAudioSourceIsChangedToWhatCanPlay_data()
    {
        QTest::addColumn<QVariantList>("data");
        QTest::addColumn<QString>("call");
        QTest::addColumn<QByteArray>("reason");
        const auto accepted = [](const char* name, const QVariantList& data, const char* call) {
            QTest::newRow(name) << data << text(call) << QByteArray();
        };
        const auto refused = [](const char* name, const QVariantList& data, const char* reason) {
            QTest::newRow(name) << data << QString() << QByteArray(reason);
        };
        accepted("next", {}, "GlobalSource.setAudioSource(12, -1)");
        accepted("satellite, bank 1", {2, 1}, "GlobalSource.setAudioSource(2, 1)");
        accepted("player", {16}, "GlobalSource.setAudioSource(16, -1)");
        refused("no disc", {4}, "This source cannot play now");
        refused("no phone", {35, -1}, "This source cannot play now");
        refused("unknown", {99}, "There is no such source");
        refused("none", {-1}, "There is no such source");
        refused("text", {text("radio")}, "There is no such source");
    }

    void theAudioSourceIsChangedToWhatCanPlay()
    {
        QFETCH(QVariantList, data);
        QFETCH(QString, call);
        QFETCH(QByteArray, reason);
        if (call.isEmpty()) {
            QVERIFY(failsWith(HmiIntentManager::ChangeAudioSource, data, reason.constData()));
            QCOMPARE(BridgeTester::takeCalls(), QStringList());
        } else {
            QVERIFY(request(HmiIntentManager::ChangeAudioSource, data));
            QCOMPARE(nextCalls(), QStringList{call});
        }
    }

    void anIntentOpensTheScreenThatItIsFor_data()
    {
        QTest::addColumn<int>("intent");
        QTest::addColumn<QByteArray>("view");
        QTest::newRow("phone") << int(HmiIntentManager::ShowPhone) << QByteArray("PHONE.Main");
        QTest::newRow("phone settings") << int(HmiIntentManager::PhoneSettings) << QByteArray("SETTINGS.Phone.Main");
        QTest::newRow("settings") << int(HmiIntentManager::RequestSettings) << QByteArray("SETTINGS.Main");
        QTest::newRow("sound") << int(HmiIntentManager::ShowSoundSettings) << QByteArray("SETTINGS.Sound.Main");
        QTest::newRow("navigation") << int(HmiIntentManager::ShowNavigationMenu) << QByteArray("NAVIGATION.Main");
        QTest::newRow("climate") << int(HmiIntentManager::ShowClimate) << QByteArray("CLIMATE.Main");
        QTest::newRow("messages") << int(HmiIntentManager::ShowMessageCenter) << QByteArray("MESSAGES.Main");
        QTest::newRow("apps") << int(HmiIntentManager::ShowApps) << QByteArray("APPS.Main");
        QTest::newRow("home") << int(HmiIntentManager::GoHome) << QByteArray("SYSTEM.Launcher");
    }

    void anIntentOpensTheScreenThatItIsFor()
    {
        QFETCH(int, intent);
        QFETCH(QByteArray, view);
        QVERIFY(open("SETTINGS.About"));
        QVERIFY(request(intent));
        QVERIFY(Screen::shows(view.constData()));
    }

    void aCallWithoutANumberAsksForOne()
    {
        BridgeTester::setState("PhoneSource", {{"deviceName", text("A phone")}});
        QVERIFY(request(HmiIntentManager::MakePhoneCall));
        QVERIFY(Screen::shows("PHONE.Keypad"));
        QVERIFY(failsWith(HmiIntentManager::MakePhoneCall, {QString(1000, QLatin1Char('1'))},
                          "This is no telephone number"));
        QCOMPARE(transient(), text("SYSTEM.Notice"));
    }

    void everyIntentOfTheProductCanBeMonitored_data()
    {
        QTest::addColumn<int>("intent");
        using Manager = HmiIntentManager;
        for (const int intent :
             {Manager::GoHome, Manager::EnterValetMode, Manager::ShowProjection, Manager::RequestDisplayOff,
              Manager::RequestDisplayToggle, Manager::ExitDisplayOffMode, Manager::ChangeAudioSource,
              Manager::ShowCurrentAudioPrimary, Manager::CancelAnnouncement, Manager::SuspendMediaPlayback,
              Manager::ResumeMediaPlayback, Manager::ShowPhone, Manager::MakePhoneCall, Manager::PhoneSettings,
              Manager::PhoneSiriNotEnabled, Manager::RequestSettings, Manager::ShowSoundSettings})
            QTest::addRow("%d", intent) << intent;
    }

    void everyIntentOfTheProductCanBeMonitored()
    {
        QFETCH(int, intent);
        QVERIFY(HmiIntentManager::instance()->canPerformAction(intent));
        QVERIFY(HmiIntentManager::instance()->intentMonitor(intent));
    }

    void whatIsSwitchedOffCannotBeDarkened()
    {
        QVERIFY(isEnabled(HmiIntentManager::RequestDisplayOff));
        BridgeTester::setState("GlobalSource", {{"powerOn", false}});
        QVERIFY(popup("SYSTEM.Standby"));
        QVERIFY(!isEnabled(HmiIntentManager::RequestDisplayOff));
        BridgeTester::sendEvent("KeySource", "keyEvent", {60, 0});
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
        BridgeTester::sendEvent("KeySource", "keyEvent", {60, 2});
        QCOMPARE(nextCalls(), QStringList{text("GlobalSource.sendPowerOnOffKeyPressed()")});
        BridgeTester::setState("GlobalSource", {{"powerOn", true}});
        QVERIFY(popup(""));
        QVERIFY(isEnabled(HmiIntentManager::RequestDisplayOff));
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<SystemScreensTest>(argc, argv);
}

#include "tst_systemscreens.moc"
