// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "keyboard.h"
#include "logcapture.h"
#include "screen.h"
#include "vehiclekeys.h"

#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/SpeechSource>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/StateMachine>
#include <HmiVehicle/embeddedvehicle.h>
#include <HmiVehicle/vehicleservice.h>

#include <atomic>
#include <memory>

using AL2HMIBridge::BridgeConnection;
using AL2HMIBridge::BridgeEndpoint;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::StateMachine;
using HmiVehicle::Channel;
using HmiVehicle::EmbeddedVehicle;
using HmiVehicle::Vehicle;
using HmiVehicle::VehicleService;

namespace {

EmbeddedVehicle& vehicle()
{
    static EmbeddedVehicle embedded([] {
        Vehicle::Options options;
        options.frozen = true;
        return options;
    }());
    return embedded;
}

} // namespace

/// The head unit with the simulated vehicle, over the real bridge.
class DriveTest : public QObject
{
    Q_OBJECT

    static bool open(const char* view)
    {
        return Screen::views()->requestView(QString::fromLatin1(view)) && Screen::shows(view);
    }

    /// The HMI has the vehicle's state, and the vehicle an HMI that its keys go to.
    static bool isSynchronised()
    {
        const auto reachesKeys = [] {
            static std::atomic<int> count;
            count = 0;
            vehicle().runInService([](VehicleService& service) { count = service.hmiCount(Channel::Priority); });
            return QTest::qWaitFor([] { return count > 0; }, 50);
        };
        const auto* const bridge = BridgeConnection::instance();
        return QTest::qWaitFor(
            [&] {
                return bridge->synchronised() && bridge->channelConnected(BridgeEndpoint::Priority) && reachesKeys();
            },
            20000);
    }

    static bool popup(const char* name)
    {
        return QTest::qWaitFor([name] { return Screen::views()->currentPopup() == QLatin1String(name); })
               && (*name == '\0' || Screen::isDrawn());
    }

    /// A key of the PC's keyboard, which is one of the vehicle's.
    static void press(Qt::Key key) { QTest::keyClick(Screen::window(), key); }

    /// Held for longer than the vehicle takes for a long press.
    static void hold(Qt::Key key)
    {
        QTest::keyPress(Screen::window(), key);
        vehicle().run([](Vehicle& model) { model.advance(1000); });
        QTest::keyRelease(Screen::window(), key);
    }

    static void set(const char* source, const char* field, const QJsonValue& value)
    {
        vehicle().run(
            [=](Vehicle& model) { model.setState(QString::fromLatin1(source), QString::fromLatin1(field), value); });
    }

    static bool becomes(const char* item, const QString& text)
    {
        return QTest::qWaitFor([&] { return Screen::text(item) == text; });
    }

    static bool becomes(const char* item, const char* property, bool value)
    {
        return QTest::qWaitFor(
            [&] { return Screen::find(item) && Screen::find(item)->property(property).toBool() == value; });
    }

    std::unique_ptr<LogCapture> m_log;

private Q_SLOTS:
    void initTestCase() { new Keyboard(Screen::window(), keysOf(&vehicle())); }

    void init()
    {
        m_log = std::make_unique<LogCapture>();
        vehicle().stop();
        QTRY_VERIFY(!BridgeConnection::instance()->connected());
        vehicle().start(); // each test has a new one
        QVERIFY(isSynchronised());
        StateMachine::instance()->sendKeySignal(QStringLiteral("Home"));
        QCoreApplication::processEvents();
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        for (auto* const module : StateMachine::instance()->findChildren<HmiLayeredState*>())
            module->reset();
    }

    void cleanup() { m_log.reset(); }

    void seekingBringsTheNextStationToTheScreen()
    {
        QVERIFY(open("RADIO.Main"));
        const QString before = Screen::text("frequency");
        QVERIFY(!before.isEmpty());
        QVERIFY(Screen::tap("seekUp"));
        QTRY_VERIFY(Screen::text("frequency") != before);
        const QString next = Screen::text("frequency");
        QVERIFY(Screen::tap("seekDown"));
        QTRY_COMPARE(Screen::text("frequency"), before);
        QVERIFY(Screen::tap("preset2"));
        QTRY_COMPARE(Screen::text("frequency"), next);
        QVERIFY(Screen::find("preset2")->property("current").toBool());
    }

    void theBandIsChangedOnTheScreen()
    {
        QVERIFY(open("RADIO.Main"));
        const QString fm = Screen::text("frequency");
        QMetaObject::invokeMethod(Screen::find("bands"), "chosen", Q_ARG(int, 1));
        QTRY_COMPARE(AL2HMIBridge::GlobalSource::instance()->mainAudioSource(), AL2HMIBridge::GlobalSource::AudioAM);
        QTRY_VERIFY(Screen::text("frequency") != fm);
    }

    void aCallIsTakenAndEnded()
    {
        vehicle().run([](Vehicle& model) { model.ring(QStringLiteral("+1 555 0100")); });
        QTRY_COMPARE(Screen::views()->currentPopup(), QStringLiteral("PHONE.IncomingCall"));
        QVERIFY(!Screen::text("incomingCaller").isEmpty());
        QVERIFY(Screen::tap("acceptCall"));
        QVERIFY(Screen::shows("PHONE.Call"));
        QTRY_COMPARE(Screen::views()->currentPopup(), QString());
        QVERIFY(Screen::tap("hangUp"));
        QVERIFY(Screen::shows("PHONE.Main"));
        QVERIFY(!AL2HMIBridge::PhoneSource::instance()->callConnected());
    }

    void aRejectedCallLeavesTheScreenAsItWas()
    {
        QVERIFY(open("SETTINGS.Display"));
        vehicle().run([](Vehicle& model) { model.ring(QStringLiteral("+1 555 0100")); });
        QTRY_COMPARE(Screen::views()->currentPopup(), QStringLiteral("PHONE.IncomingCall"));
        QVERIFY(Screen::tap("rejectCall"));
        QTRY_COMPARE(Screen::views()->currentPopup(), QString());
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("SETTINGS.Display"));
    }

    void theSeekKeysBringStationsToTheScreen()
    {
        QVERIFY(open("RADIO.Main"));
        const QString first = Screen::text("frequency");
        press(Qt::Key_Right);
        QTRY_VERIFY(Screen::text("frequency") != first);
        press(Qt::Key_Left);
        QVERIFY(becomes("frequency", first));
    }

    void theScreenFollowsTheWheelThroughThePresets()
    {
        QVERIFY(open("RADIO.Main"));
        QVERIFY(becomes("preset1", "current", true));
        QVERIFY(!Screen::find("recalledRing"));
        press(Qt::Key_L);
        QVERIFY(becomes("preset2", "current", true));
        QVERIFY(becomes("preset2", "recalled", true));
        QVERIFY(Screen::find("recalledRing"));
        press(Qt::Key_J);
        QVERIFY(becomes("preset1", "current", true));
        press(Qt::Key_J);
        QVERIFY(becomes("preset6", "current", true));
        QVERIFY(becomes("preset6", "recalled", true));
        QTRY_VERIFY(!Screen::find("recalledRing")); // for a moment only
        press(Qt::Key_3);
        QVERIFY(becomes("preset3", "current", true));
        QVERIFY(!Screen::find("recalledRing")); // the front panel is near the screen
    }

    void thePresetKeysStoreWhatIsHeard()
    {
        QVERIFY(open("RADIO.Main"));
        press(Qt::Key_2);
        QVERIFY(becomes("preset2", "current", true));
        const QString frequency = Screen::text("frequency");
        hold(Qt::Key_5);
        QVERIFY(becomes("preset5", "current", true));
        QCOMPARE(Screen::text("frequency"), frequency);
        QVERIFY(Screen::tap("presetBank"));
        QVERIFY(becomes("bankNumber", QStringLiteral("2")));
        QVERIFY(becomes("preset5", "current", false));
    }

    void aLostDigitalSignalIsShownAndFoundAgainByTheDownwardKey()
    {
        QVERIFY(open("RADIO.Main"));
        QVERIFY(becomes("hdBadge", "lit", true));
        const QString frequency = Screen::text("frequency");
        set("FMTunerSource", "hdSignalLossStatus", 1);
        QVERIFY(becomes("hdBadge", "lit", false));
        press(Qt::Key_Left);
        QTRY_VERIFY(AL2HMIBridge::FMTunerSource::instance()->hdSignalLossStatus() == 0);
        QCOMPARE(Screen::text("frequency"), frequency);
        set("FMTunerSource", "hdSignalLossStatus", 1);
        QVERIFY(becomes("hdBadge", "lit", false));
        press(Qt::Key_Right);
        QTRY_VERIFY(Screen::text("frequency") != frequency);
    }

    void theSourceKeysChangeWhatIsShown()
    {
        QCOMPARE(Screen::text("nowPlayingSource"), QStringLiteral("FM"));
        press(Qt::Key_C);
        QVERIFY(becomes("nowPlayingSource", QStringLiteral("CD")));
        QVERIFY(becomes("nowPlayingTitle", QStringLiteral("Overture")));
        press(Qt::Key_L);
        QVERIFY(becomes("nowPlayingTitle", QStringLiteral("The Ferry")));
        QVERIFY(open("MEDIA.Main"));
        QVERIFY(becomes("playPause", "active", true));
        press(Qt::Key_Space);
        QTRY_COMPARE(AL2HMIBridge::CDSource::instance()->cdStatus(), AL2HMIBridge::CDSource::CDPaused);
        QTRY_COMPARE(Screen::find("playPause")->property("icon").toString(), QStringLiteral("play"));
        press(Qt::Key_S);
        QVERIFY(becomes("mediaTitle", QStringLiteral("Neon Rain")));
        press(Qt::Key_X);
        QVERIFY(open("RADIO.Main"));
        QVERIFY(becomes("channelName", QStringLiteral("Orbit Hits")));
    }

    void aSourceIsChosenOnTheScreen()
    {
        QVERIFY(Screen::tap("launcherSources"));
        QVERIFY(popup("SYSTEM.AudioSources"));
        QVERIFY(Screen::tap("source5"));
        QVERIFY(popup(""));
        QVERIFY(Screen::shows("MEDIA.Main"));
        QVERIFY(becomes("mediaTitle", QStringLiteral("Overture")));
        QVERIFY(Screen::tap("openSources"));
        QVERIFY(popup("SYSTEM.AudioSources"));
        QVERIFY(Screen::tap("source1"));
        QVERIFY(Screen::shows("RADIO.Main"));
        QVERIFY(becomes("stationName", QStringLiteral("Prairie Talk")));
    }

    void aTrackOfTheLibraryIsPlayed()
    {
        QVERIFY(open("MEDIA.Main"));
        QMetaObject::invokeMethod(Screen::find("kinds"), "chosen", Q_ARG(int, 0));
        QVERIFY(becomes("mediaTitle", QStringLiteral("Neon Rain")));
        QVERIFY(Screen::tap("openLibrary"));
        QVERIFY(Screen::shows("MEDIA.Library"));
        QVERIFY(Screen::tap("track14"));
        QVERIFY(Screen::shows("MEDIA.Main"));
        QVERIFY(becomes("mediaTitle", QStringLiteral("Cartas")));
        QTRY_COMPARE(AL2HMIBridge::GlobalSource::instance()->mainAudioSource(), AL2HMIBridge::GlobalSource::AudioMedia);
    }

    void theEndKeyEndsACall()
    {
        QVERIFY(open("RADIO.Main"));
        vehicle().run([](Vehicle& model) { model.ring(QStringLiteral("+1 555 0100")); });
        QVERIFY(popup("PHONE.IncomingCall"));
        QVERIFY(Screen::tap("acceptCall"));
        QVERIFY(Screen::shows("PHONE.Call"));
        QCOMPARE(Screen::text("callState"), QStringLiteral("0:00"));
        press(Qt::Key_E);
        QVERIFY(Screen::shows("PHONE.Main"));
        QVERIFY(!AL2HMIBridge::PhoneSource::instance()->callConnected());
    }

    void anEmergencyKeepsTheEndKeyFromACall()
    {
        vehicle().run([](Vehicle& model) { model.ring(QStringLiteral("+1 555 0100")); });
        QVERIFY(popup("PHONE.IncomingCall"));
        QVERIFY(Screen::tap("acceptCall"));
        QVERIFY(Screen::shows("PHONE.Call"));
        set("EAPhoneSource", "eventsBlocked", true);
        QVERIFY(becomes("hangUp", "active", false));
        press(Qt::Key_E);
        press(Qt::Key_Up); // what comes after it has an effect
        QVERIFY(becomes("volumeText", QStringLiteral("13")));
        QVERIFY(AL2HMIBridge::PhoneSource::instance()->callConnected());
        set("EAPhoneSource", "eventsBlocked", false);
        QVERIFY(becomes("hangUp", "active", true));
        press(Qt::Key_E);
        QVERIFY(Screen::shows("PHONE.Main"));
    }

    void aContactIsCalledFromTheList()
    {
        QVERIFY(open("PHONE.Main"));
        QVERIFY(Screen::tap("contact1"));
        QVERIFY(Screen::shows("PHONE.Call"));
        QVERIFY(becomes("caller", QStringLiteral("Ben Okafor")));
        QVERIFY(open("PHONE.Main"));
        QVERIFY(!Screen::find("contact1")->property("active").toBool()); // a call runs
        QVERIFY(Screen::tap("callChip"));
        QVERIFY(Screen::shows("PHONE.Call"));
        QVERIFY(Screen::tap("hangUp"));
        QVERIFY(Screen::shows("PHONE.Main"));
        QVERIFY(becomes("contact1", "active", true));
    }

    void aVoiceSessionEndsWithAKeyButNotWithTheVolume()
    {
        QVERIFY(open("RADIO.Main"));
        set("PhoneSource", "siriSupported", false);
        QTRY_VERIFY(!AL2HMIBridge::PhoneSource::instance()->siriSupported()); // keys overtake state
        press(Qt::Key_V);
        QVERIFY(popup("SYSTEM.Voice"));
        QVERIFY(!Screen::text("voicePrompt").isEmpty());
        const int voice = AL2HMIBridge::GlobalSource::instance()->voiceVolume();
        const int music = AL2HMIBridge::GlobalSource::instance()->volume();
        press(Qt::Key_Up);
        QVERIFY(becomes("volumeText", QString::number(voice + 1)));
        QCOMPARE(AL2HMIBridge::GlobalSource::instance()->volume(), music);
        QCOMPARE(Screen::views()->currentPopup(), QStringLiteral("SYSTEM.Voice"));
        press(Qt::Key_M);
        QVERIFY(popup(""));
        press(Qt::Key_Up);
        QVERIFY(becomes("volumeText", QString::number(music + 1)));
    }

    void aVoiceRecognitionThatIsNotReadySaysSo()
    {
        set("SpeechSource", "voiceRecognitionEngineReady", false);
        QTRY_VERIFY(!AL2HMIBridge::SpeechSource::instance()->voiceRecognitionEngineReady());
        press(Qt::Key_V);
        QVERIFY(popup("SYSTEM.Voice"));
        QCOMPARE(Screen::text("voiceTitle"), QStringLiteral("Voice control is not ready"));
        QVERIFY(!Screen::text("voicePrompt").isEmpty());
        QVERIFY(Screen::tap("cancelVoice"));
        QVERIFY(popup(""));
    }

    void anAssistantThatIsSwitchedOffIsExplained()
    {
        set("PhoneSource", "siriEnabled", false);
        QTRY_VERIFY(!AL2HMIBridge::PhoneSource::instance()->siriEnabled());
        hold(Qt::Key_V);
        QVERIFY(popup("PHONE.AssistantHint"));
        QVERIFY(Screen::tap("dismissPopup"));
        QVERIFY(popup(""));
        set("PhoneSource", "siriEnabled", true);
        QTRY_VERIFY(AL2HMIBridge::PhoneSource::instance()->siriEnabled());
        hold(Qt::Key_V);
        QVERIFY(popup("PHONE.Assistant"));
        hold(Qt::Key_V);
        QVERIFY(popup(""));
    }

    void aTrafficAnnouncementEndsWithItsKey()
    {
        QVERIFY(open("RADIO.Main"));
        press(Qt::Key_T);
        QTRY_VERIFY(Screen::find("taBadge"));
        vehicle().run([](Vehicle& model) { model.startTrafficAnnouncement(QStringLiteral("Stones on the road")); });
        QVERIFY(popup("RADIO.Announcement"));
        QCOMPARE(Screen::text("announcementText"), QStringLiteral("Stones on the road"));
        press(Qt::Key_T);
        QVERIFY(popup(""));
        QTRY_COMPARE(AL2HMIBridge::FMTunerSource::instance()->announcementType(), 0);
        QVERIFY(Screen::find("taBadge")); // it ended the announcement only
        press(Qt::Key_T);
        QTRY_VERIFY(!Screen::find("taBadge"));
    }

    void valetModeLocksVolumeAndPower()
    {
        QVERIFY(open("SETTINGS.Main"));
        QVERIFY(Screen::tap("page4"));
        QVERIFY(popup("SYSTEM.Valet"));
        const int volume = AL2HMIBridge::GlobalSource::instance()->volume();
        press(Qt::Key_Up);
        press(Qt::Key_F12);
        press(Qt::Key_M); // what comes after them has an effect
        QTRY_VERIFY(AL2HMIBridge::GlobalSource::instance()->muted());
        QCOMPARE(AL2HMIBridge::GlobalSource::instance()->volume(), volume);
        QCOMPARE(Screen::views()->currentPopup(), QStringLiteral("SYSTEM.Valet"));
        QVERIFY(Screen::tap("leaveValet"));
        QVERIFY(popup(""));
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("SETTINGS.Main"));
    }

    void thePowerKeyLeadsToStandbyAndATouchBack()
    {
        QVERIFY(open("RADIO.Main"));
        press(Qt::Key_F12);
        QVERIFY(popup("SYSTEM.Standby"));
        QCOMPARE(Screen::text("standbyClock"), QStringLiteral("10:42"));
        QTest::mouseClick(Screen::window(), Qt::LeftButton, Qt::NoModifier, QPoint(100, 100));
        QVERIFY(popup(""));
        press(Qt::Key_F12);
        QVERIFY(popup("SYSTEM.Standby"));
        press(Qt::Key_F12);
        QVERIFY(popup(""));
        press(Qt::Key_F12);
        QVERIFY(popup("SYSTEM.Standby"));
        press(Qt::Key_F11);
        QVERIFY(popup(""));
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("RADIO.Main"));
    }

    void theDisplayKeyDarkensTheScreen()
    {
        press(Qt::Key_F11);
        QVERIFY(popup("SYSTEM.DisplayOff"));
        press(Qt::Key_F11);
        QVERIFY(popup(""));
    }

    void aProjectedPhoneIsShownWhileItIsThere()
    {
        vehicle().run([](Vehicle& model) { model.setProjectionMode(1); });
        QTRY_VERIFY(Screen::find("railProjection"));
        QVERIFY(Screen::tap("railProjection"));
        QVERIFY(Screen::shows("SYSTEM.Projection"));
        QCOMPARE(Screen::text("projectedDevice"), QStringLiteral("Dana's phone"));
        vehicle().run([](Vehicle& model) { model.setProjectionMode(0); });
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
    }

    void theNightComesFromTheVehicle()
    {
        vehicle().run(
            [](Vehicle& model) { model.setState(QStringLiteral("GlobalSource"), QStringLiteral("nightMode"), true); });
        QTRY_COMPARE(
            HmiGuiFramework::DataStore::get<QObject>(QStringLiteral("UiThemeManager"))->property("palette").toString(),
            QStringLiteral("night"));
    }

    void aRestartedVehicleBringsItsStateToTheScreen()
    {
        QVERIFY(open("RADIO.Main"));
        const QString start = Screen::text("frequency");
        for (int i = 0; i < 20; ++i) {
            QVERIFY(Screen::tap("seekUp"));
            QTRY_VERIFY(Screen::text("frequency") != start);
            vehicle().stop();
            QTRY_VERIFY(!BridgeConnection::instance()->connected());
            vehicle().start();
            QVERIFY(isSynchronised());
            QCOMPARE(Screen::text("frequency"), start);
        }
    }

    void aLostVehicleIsShownAndCallsAreReported()
    {
        vehicle().stop();
        QTRY_VERIFY(!BridgeConnection::instance()->connected());
        QVERIFY(open("RADIO.Main"));
        QVERIFY(Screen::tap("seekUp"));
        const QStringList warnings = m_log->take(QStringLiteral("al2hmi.bridge"), QtWarningMsg);
        QCOMPARE(warnings.size(), 1);
        QVERIFY2(warnings.at(0).contains(QStringLiteral("GlobalSource.sendShortSeekUp")), qPrintable(warnings.at(0)));
        const QString shown = Screen::text("frequency");
        vehicle().start();
        QVERIFY(isSynchronised());
        QCOMPARE(Screen::text("frequency"), shown); // the call was not delivered late
    }
};

int main(int argc, char** argv)
{
    qAddPreRoutine([] { vehicle().start(); });
    qAddPostRoutine([] { vehicle().stop(); });
    return runInHeadUnit<DriveTest>(argc, argv, [](BridgeEndpoint::Channel channel) {
        return vehicle().connectChannel(BridgeEndpoint::channelName(channel));
    });
}

#include "tst_drive.moc"
