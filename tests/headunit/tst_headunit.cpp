// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <HmiCore/HmiModuleIntegration>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/AppSettings>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/StateMachine>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiIntentManager;
using HmiGuiFramework::AppSettings;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::StateMachine;

/// What a driver does with the head unit, from touch to call and from message to screen.
class HeadUnitTest : public QObject
{
    Q_OBJECT

    static QVariantMap preset(int index, const char* name)
    {
        return {{QStringLiteral("bank"), 1},
                {QStringLiteral("index"), index},
                {QStringLiteral("name"), QString::fromUtf8(name)},
                {QStringLiteral("frequency"), QStringLiteral("98.3")}};
    }

    static bool open(const char* view)
    {
        return Screen::views()->requestView(QString::fromLatin1(view)) && Screen::shows(view);
    }

    static bool isActive(const char* state)
    {
        const auto* const found = StateMachine::instance()->findState(QString::fromLatin1(state));
        return found && found->active();
    }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        StateMachine::instance()->sendKeySignal(QStringLiteral("Home"));
        QCoreApplication::processEvents(); // the signal comes before whatever the test asks for
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        for (auto* const module : StateMachine::instance()->findChildren<HmiLayeredState*>())
            module->reset(); // no screens of the test before
        BridgeTester::takeCalls();
    }

    void cleanup()
    {
        m_vehicle.reset();
        m_log.reset();
    }

    void theLauncherHasATileForEachModuleByPriority()
    {
        QStringList tiles;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->objectName().startsWith(QLatin1String("tile")))
                tiles.append(item->objectName());
        });
        QCOMPARE(tiles, QStringList({QStringLiteral("tileRADIO"), QStringLiteral("tileNAVIGATION"),
                                     QStringLiteral("tileMEDIA"), QStringLiteral("tilePHONE"),
                                     QStringLiteral("tileCLIMATE"), QStringLiteral("tileMESSAGES"),
                                     QStringLiteral("tileAPPS"), QStringLiteral("tileSETTINGS")}));
        QVERIFY(Screen::find("tileRADIO")->property("isHome").toBool());
        QVERIFY(!Screen::find("tilePHONE")->property("isHome").toBool());
    }

    void aTileOpensItsModule_data()
    {
        QTest::addColumn<QByteArray>("tile");
        QTest::addColumn<QByteArray>("view");
        QTest::addColumn<QString>("title");
        QTest::newRow("radio") << QByteArray("tileRADIO") << QByteArray("RADIO.Main") << QStringLiteral("Radio");
        QTest::newRow("media") << QByteArray("tileMEDIA") << QByteArray("MEDIA.Main") << QStringLiteral("Media");
        QTest::newRow("phone") << QByteArray("tilePHONE") << QByteArray("PHONE.Main") << QStringLiteral("Phone");
        QTest::newRow("settings") << QByteArray("tileSETTINGS") << QByteArray("SETTINGS.Main")
                                  << QStringLiteral("Settings");
    }

    void aTileOpensItsModule()
    {
        QFETCH(QByteArray, tile);
        QFETCH(QByteArray, view);
        QFETCH(QString, title);
        QVERIFY(Screen::tap(tile.constData()));
        QVERIFY(Screen::shows(view.constData()));
        QVERIFY(isActive(view.constData()));
        QCOMPARE(Screen::text("statusTitle"), title);
        QVERIFY(Screen::tap("railHome"));
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
    }

    void backGoesThroughTheScreensOfAModuleAndThenHome()
    {
        QVERIFY(open("RADIO.Main"));
        QVERIFY(Screen::tap("openStations"));
        QVERIFY(Screen::shows("RADIO.Stations"));
        QVERIFY(Screen::tap("railBack"));
        QVERIFY(Screen::shows("RADIO.Main"));
        QVERIFY(Screen::tap("railBack"));
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
    }

    void theRadioShowsWhatTheTunerSays()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}});
        BridgeTester::setState("FMTunerSource", {{"frequency", QStringLiteral("98.3")},
                                                 {"frequencyUnit", QStringLiteral("MHz")},
                                                 {"stationName", QStringLiteral("Harbour FM")},
                                                 {"activePreset", 8},
                                                 {"activePresetBank", 1},
                                                 {"presets", QVariantList{preset(1, "One"), preset(2, "Two")}}});
        QCOMPARE(Screen::text("nowPlayingTitle"), QStringLiteral("Harbour FM"));
        QVERIFY(open("RADIO.Main"));
        QCOMPARE(Screen::text("frequency"), QStringLiteral("98.3"));
        QCOMPARE(Screen::text("stationName"), QStringLiteral("Harbour FM"));
        QVERIFY(Screen::find("preset2")->property("current").toBool());
        QVERIFY(!Screen::find("preset1")->property("current").toBool());
        BridgeTester::setState("FMTunerSource", {{"stationName", QStringLiteral("<b>Bold</b> FM")}});
        QCOMPARE(Screen::text("stationName"), QStringLiteral("<b>Bold</b> FM"));
        QCOMPARE(Screen::find("stationName")->property("textFormat").toInt(), 0); // plain
    }

    void theRadiosKeysReachTheTuner()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}});
        QVERIFY(open("RADIO.Main"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("seekUp"));
        QVERIFY(Screen::tap("seekDown"));
        QVERIFY(Screen::tap("preset3"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList({QStringLiteral("GlobalSource.sendShortSeekUp()"),
                                                         QStringLiteral("GlobalSource.sendShortSeekDown()"),
                                                         QStringLiteral("FMTunerSource.recallPreset(1, 3)")}));
    }

    void thePresetsAreThoseOfTheBank()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}});
        BridgeTester::setState("FMTunerSource", {{"activePreset", 2}, {"activePresetBank", 0}});
        QVERIFY(open("RADIO.Main"));
        QCOMPARE(Screen::text("bankNumber"), QStringLiteral("1"));
        QVERIFY(Screen::find("preset2")->property("current").toBool());
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("presetBank"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("FMTunerSource.selectPresetBank(1)")});
        BridgeTester::setState("FMTunerSource", {{"activePresetBank", 1}});
        QCOMPARE(Screen::text("bankNumber"), QStringLiteral("2"));
        QVERIFY(!Screen::find("preset2")->property("current").toBool()); // it plays on, from the other bank
        QVERIFY(Screen::tap("presetBank"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("FMTunerSource.selectPresetBank(0)")});
    }

    void theRadioSaysHowTheStationIsReceived()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}});
        QVERIFY(open("RADIO.Main"));
        QVERIFY(!Screen::find("hdBadge") && !Screen::find("stereoBadge") && !Screen::find("taBadge"));
        BridgeTester::setState("FMTunerSource", {{"hdAvailable", true}, {"stereo", true}, {"signalStrength", 61}});
        QVERIFY(Screen::find("hdBadge")->property("lit").toBool());
        QVERIFY(Screen::find("stereoBadge"));
        QCOMPARE(Screen::find("radioSignal")->property("level").toInt(), 4);
        BridgeTester::setState("FMTunerSource", {{"hdSignalLossStatus", 1}});
        QVERIFY(!Screen::find("hdBadge")->property("lit").toBool());
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("toggleTraffic"));
        QCOMPARE(BridgeTester::takeCalls(),
                 QStringList{QStringLiteral("FMTunerSource.toggleTpSeekInProgress(1, true)")});
        BridgeTester::setState("FMTunerSource", {{"trafficAnnouncementEnabled", true}, {"tpSeekInProgress", true}});
        QVERIFY(!Screen::find("taBadge")->property("lit").toBool());
        BridgeTester::setState("FMTunerSource", {{"tpSeekInProgress", false}});
        QVERIFY(Screen::find("taBadge")->property("lit").toBool());
    }

    void theFillingOfPresetsCanBeCancelled()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 0}});
        QVERIFY(open("RADIO.Main"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("autoStore"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("AMTunerSource.startAutoStore()")});
        BridgeTester::setState("AMTunerSource", {{"autoStoreInProgress", true}});
        QVERIFY(!Screen::find("preset1"));
        QVERIFY(Screen::tap("cancelAutoStore"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("AMTunerSource.sendAutoStoreCancel()")});
        BridgeTester::setState("AMTunerSource", {{"autoStoreProgress", 40}});
        QCOMPARE(Screen::find("autoStoreProgress")->property("ratio").toDouble(), 0.4);
        BridgeTester::sendEvent("KeySource", "keyEvent", {48, 0}); // as every key does, but those of the volume
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("AMTunerSource.sendAutoStoreCancel()")});
        BridgeTester::setState("AMTunerSource", {{"autoStoreInProgress", false}});
        QVERIFY(Screen::find("preset1"));
    }

    void theSatelliteTunerReplaysWhatWasHeard()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 2}});
        BridgeTester::setState("XMTunerSource", {{"channelNumber", 21},
                                                 {"stationName", QStringLiteral("Backroads")},
                                                 {"category", QStringLiteral("Country")},
                                                 {"title", QStringLiteral("Mile Marker")},
                                                 {"playStatus", 1}});
        QVERIFY(open("RADIO.Main"));
        QCOMPARE(Screen::text("channelNumber"), QStringLiteral("21"));
        QCOMPARE(Screen::text("channelCategory"), QStringLiteral("Country"));
        QCOMPARE(Screen::text("satelliteTitle"), QStringLiteral("Mile Marker"));
        QVERIFY(!Screen::find("frequency") && !Screen::find("toggleTraffic"));
        BridgeTester::takeCalls();
        for (const char* const key : {"replayNext", "goLive", "replayPrevious", "replayPlayPause"})
            QVERIFY(Screen::tap(key)); // the first two have nothing to do on live programme
        BridgeTester::setState("XMTunerSource", {{"replayStatus", 1}, {"playStatus", 0}});
        for (const char* const key : {"replayPrevious", "replayPlayPause", "replayNext", "goLive"})
            QVERIFY(Screen::tap(key));
        QCOMPARE(
            BridgeTester::takeCalls(),
            QStringList(
                {QStringLiteral("XMTunerSource.startReplay()"), QStringLiteral("XMTunerSource.togglePlayPause(0)"),
                 QStringLiteral("XMTunerSource.seekReverseShort()"), QStringLiteral("XMTunerSource.togglePlayPause(1)"),
                 QStringLiteral("XMTunerSource.seekForwardShort()"), QStringLiteral("XMTunerSource.goLive()")}));
    }

    void theMarketsSourcesAreOffered()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}, {"destinationCountry", 0x348}});
        QVERIFY(open("RADIO.Main"));
        QVERIFY(Screen::tap("openSources"));
        QTRY_COMPARE(Screen::views()->currentPopup(), QStringLiteral("SYSTEM.AudioSources"));
        QVERIFY(Screen::find("source4") && !Screen::find("source5")); // no DAB
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 0x310}});
        QTRY_VERIFY(Screen::find("source3") && !Screen::find("source4")); // no satellite either
        QVERIFY(Screen::tap("dismissPopup"));
        QTRY_COMPARE(Screen::views()->currentPopup(), QString());
    }

    void theSourceIsChosenFromAll()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 1}, {"destinationCountry", 2}});
        BridgeTester::setState("CDSource", {{"cdStatus", 0}});
        QVERIFY(open("RADIO.Main"));
        QVERIFY(Screen::tap("openSources"));
        QTRY_COMPARE(Screen::views()->currentPopup(), QStringLiteral("SYSTEM.AudioSources"));
        QVERIFY(Screen::isDrawn());
        QVERIFY(Screen::find("source0")->property("selected").toBool());
        QVERIFY(Screen::find("source5") && !Screen::find("source6"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("source5")); // no disc
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
        QVERIFY(Screen::tap("source4"));
        QTRY_VERIFY(!BridgeTester::calls().isEmpty());
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("GlobalSource.setAudioSource(16, -1)")});
        QCOMPARE(Screen::views()->currentPopup(), QString());
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("RADIO.Main"));
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 16}});
        QVERIFY(Screen::shows("MEDIA.Main"));
        BridgeTester::setState("ProjectionSource", {{"projectionMode", 1}});
        QVERIFY(Screen::tap("openSources"));
        QTRY_VERIFY(Screen::find("source6"));
        QVERIFY(Screen::tap("dismissPopup"));
        QTRY_COMPARE(Screen::views()->currentPopup(), QString());
    }

    void theMediaScreenShowsAndOperatesWhatIsHeard_data()
    {
        QTest::addColumn<int>("source");
        QTest::addColumn<QString>("title");
        QTest::addColumn<QStringList>("calls");
        QTest::newRow("player") << 16 << QStringLiteral("Neon Rain")
                                << QStringList({QStringLiteral("MediaAudioSource.previous()"),
                                                QStringLiteral("MediaAudioSource.togglePlayPause()"),
                                                QStringLiteral("MediaAudioSource.next()")});
        QTest::newRow("disc") << 4 << QStringLiteral("Overture")
                              << QStringList({QStringLiteral("CDSource.previousTrack()"),
                                              QStringLiteral("CDSource.togglePlayPause(3)"),
                                              QStringLiteral("CDSource.nextTrack()")});
        QTest::newRow("phone") << 35 << QStringLiteral("A phone")
                               << QStringList({QStringLiteral("ProjectionSource.projectionButtonPress(6)"),
                                               QStringLiteral("ProjectionSource.projectionButtonRelease(6)"),
                                               QStringLiteral("ProjectionSource.projectionButtonPress(83)"),
                                               QStringLiteral("ProjectionSource.projectionButtonRelease(83)"),
                                               QStringLiteral("ProjectionSource.projectionButtonPress(7)"),
                                               QStringLiteral("ProjectionSource.projectionButtonRelease(7)")});
    }

    void theMediaScreenShowsAndOperatesWhatIsHeard()
    {
        QFETCH(int, source);
        QFETCH(QString, title);
        QFETCH(QStringList, calls);
        BridgeTester::setState("MediaAudioSource", {{"title", QStringLiteral("Neon Rain")}, {"playing", true}});
        BridgeTester::setState("CDSource", {{"cdStatus", 2}, {"track", 1}, {"title", QStringLiteral("Overture")}});
        BridgeTester::setState(
            "ProjectionSource",
            {{"projectionMode", 2}, {"projectedDeviceName", QStringLiteral("A phone")}, {"projectedPlaying", true}});
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", source}});
        QVERIFY(open("MEDIA.Main"));
        QCOMPARE(Screen::text("mediaTitle"), title);
        BridgeTester::takeCalls();
        for (const char* const key : {"previousTrack", "playPause", "nextTrack"})
            QVERIFY(Screen::tap(key));
        QCOMPARE(BridgeTester::takeCalls(), calls);
    }

    void aDriveWithoutADiscSaysSo()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 4}});
        BridgeTester::setState("CDSource", {{"cdStatus", 1}});
        QVERIFY(open("MEDIA.Main"));
        QCOMPARE(Screen::find("mediaNotice")->property("text").toString(), QStringLiteral("Reading the disc…"));
        BridgeTester::setState("CDSource", {{"cdStatus", 0}});
        QCOMPARE(Screen::find("mediaNotice")->property("text").toString(), QStringLiteral("No disc"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("playPause"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
    }

    void theLibraryIsOrderedAndPlayed()
    {
        const auto track = [](const char* title, const char* artist, const char* album) {
            return QVariant(QVariantMap{{QStringLiteral("title"), QString::fromUtf8(title)},
                                        {QStringLiteral("artist"), QString::fromUtf8(artist)},
                                        {QStringLiteral("album"), QString::fromUtf8(album)},
                                        {QStringLiteral("duration"), 200}});
        };
        BridgeTester::setState("MediaAudioSource", {{"library", QVariantList{track("Zebra", "Abel", "Second"),
                                                                             track("Élan", "Bea", "First"),
                                                                             track("Delta", "Bea", "Second")}},
                                                    {"trackIndex", 1}});
        const auto tracks = [] {
            QMap<qreal, QString> byPlace;
            for (const char* const name : {"track0", "track1", "track2"})
                if (const QQuickItem* const row = Screen::find(name))
                    byPlace.insert(row->y(), row->property("title").toString());
            return QStringList(byPlace.values());
        };
        QVERIFY(open("MEDIA.Library"));
        QCOMPARE(tracks(), QStringList({QStringLiteral("Delta"), QStringLiteral("Élan"), QStringLiteral("Zebra")}));
        QVERIFY(Screen::find("track1")->property("selected").toBool());
        const auto choose = [](int order) {
            QMetaObject::invokeMethod(Screen::find("libraryOrder"), "chosen", Q_ARG(int, order));
            return Screen::isDrawn();
        };
        QVERIFY(choose(1));
        QCOMPARE(tracks(), QStringList({QStringLiteral("Zebra"), QStringLiteral("Delta"), QStringLiteral("Élan")}));
        QVERIFY(choose(2));
        QCOMPARE(tracks(), QStringList({QStringLiteral("Élan"), QStringLiteral("Zebra"), QStringLiteral("Delta")}));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("track2"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList({QStringLiteral("MediaAudioSource.playTrack(2)"),
                                                         QStringLiteral("GlobalSource.setAudioSource(16, -1)")}));
        QVERIFY(Screen::shows("MEDIA.Main"));
    }

    void aTrackOfTheDiscIsReachedStepByStep()
    {
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 4}});
        BridgeTester::setState("CDSource", {{"cdStatus", 2}, {"track", 2}, {"trackCount", 4}});
        QVERIFY(open("MEDIA.Disc"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("discTrack4"));
        QCOMPARE(BridgeTester::takeCalls(),
                 QStringList({QStringLiteral("CDSource.nextTrack()"), QStringLiteral("CDSource.nextTrack()")}));
        QVERIFY(open("MEDIA.Disc"));
        QVERIFY(Screen::tap("discTrack1"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("CDSource.previousTrack()")});
    }

    void theScreensFollowTheAudioSource()
    {
        BridgeTester::setState("AMTunerSource", {{"frequency", QStringLiteral("810")}});
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 0}});
        QVERIFY(open("RADIO.Main"));
        QCOMPARE(Screen::text("frequency"), QStringLiteral("810"));
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", 16}}); // media: the radio keeps its band
        QCOMPARE(Screen::text("frequency"), QStringLiteral("810"));
    }

    void theSoundPageIsPartOfTheRadio()
    {
        QVERIFY(open("RADIO.Main"));
        QVERIFY(Screen::tap("openSound"));
        QVERIFY(Screen::shows("RADIO.Sound.Main"));
        QVERIFY(isActive("RADIO"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("muteToggle"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("GlobalSource.setMuted(true)")});
        QVERIFY(Screen::tap("railBack"));
        QVERIFY(Screen::shows("RADIO.Main"));
    }

    void anotherLanguageIsThereAtOnceOnTheSameScreen()
    {
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 2}, {"systemLanguage", 0}});
        QVERIFY(open("SETTINGS.Language"));
        QCOMPARE(Screen::text("statusTitle"), QStringLiteral("Language"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("languagede_DE"));
        QCOMPARE(BridgeTester::takeCalls(), {QStringLiteral("GlobalSource.setSystemLanguage(2)")});

        BridgeTester::setState("GlobalSource", {{"systemLanguage", 2}}); // the vehicle's answer
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("SETTINGS.Language"));
        QTRY_COMPARE(Screen::text("statusTitle"), QStringLiteral("Sprache"));
        QTRY_VERIFY(Screen::find("languagede_DE")->property("selected").toBool());

        BridgeTester::setState("GlobalSource", {{"systemLanguage", 7}});
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("SETTINGS.Language"));
        QTRY_COMPARE(Screen::text("statusTitle"), QStringLiteral("اللغة"));
        QVERIFY(AppSettings::instance()->rightToLeft());
        QVERIFY(Screen::isDrawn());

        // In a market without Arabic the bundle's default is used, and the page says so.
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 0x348}});
        QTRY_COMPARE(Screen::text("statusTitle"), QStringLiteral("Language"));
        QVERIFY(!AppSettings::instance()->rightToLeft());
        QTRY_VERIFY(Screen::find("languageNote"));
        QTRY_VERIFY(Screen::find("languageen_US") && Screen::find("languageen_US")->property("selected").toBool());
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 2}, {"systemLanguage", 0}});
        QTRY_VERIFY(!Screen::find("languageNote"));
    }

    void theSettingsMenuHasThePagesOfOtherModulesInOrder()
    {
        QVERIFY(open("SETTINGS.Main"));
        QStringList pages;
        for (const char* const name : {"page0", "page1", "page2", "page3", "page4", "page5", "page6", "page7"})
            pages.append(Screen::find(name) ? Screen::find(name)->property("title").toString() : QString());
        QCOMPARE(pages,
                 QStringList({QStringLiteral("Display"), QStringLiteral("Sound"), QStringLiteral("Phone"),
                              QStringLiteral("Darken the display"), QStringLiteral("Valet mode"),
                              QStringLiteral("Navigation"), QStringLiteral("Language"), QStringLiteral("About")}));
        QVERIFY(!Screen::find("page8"));
        QVERIFY(Screen::tap("page2"));
        QVERIFY(Screen::shows("SETTINGS.Phone.Main"));
        QVERIFY(isActive("SETTINGS"));
    }

    void anIncomingCallIsShownOverWhateverIsOnTheScreen()
    {
        QVERIFY(open("RADIO.Main"));
        BridgeTester::setState("PhoneSource", {{"incomingCall", true},
                                               {"callerName", QStringLiteral("Ada Martin")},
                                               {"callerNumber", QStringLiteral("123")}});
        QTRY_COMPARE(Screen::views()->currentPopup(), QStringLiteral("PHONE.IncomingCall"));
        QVERIFY(isActive("RADIO.Main"));
        QTRY_VERIFY(isActive("PHONE.IncomingCall"));
        QCOMPARE(Screen::text("incomingCaller"), QStringLiteral("Ada Martin"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("acceptCall"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("PhoneSource.acceptCall()")});

        BridgeTester::setState("PhoneSource", {{"incomingCall", false}, {"callConnected", true}});
        QTRY_COMPARE(Screen::views()->currentPopup(), QString());
        QVERIFY(Screen::shows("PHONE.Call"));
        QCOMPARE(Screen::text("caller"), QStringLiteral("Ada Martin"));
        QVERIFY(Screen::tap("hangUp"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("PhoneSource.hangUp()")});
        BridgeTester::setState("PhoneSource", {{"callConnected", false}});
        QVERIFY(Screen::shows("PHONE.Main"));
    }

    void aCallThatEndsElsewhereLeavesTheScreenAlone()
    {
        BridgeTester::setState("PhoneSource", {{"callConnected", true}});
        QVERIFY(Screen::shows("PHONE.Call"));
        QVERIFY(open("RADIO.Main"));
        BridgeTester::setState("PhoneSource", {{"callConnected", false}});
        QCoreApplication::processEvents();
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("RADIO.Main"));
    }

    void aNumberIsDialledByHand()
    {
        BridgeTester::setState("PhoneSource", {{"deviceName", QStringLiteral("A phone")}});
        QVERIFY(open("PHONE.Main"));
        QVERIFY(Screen::tap("openKeypad"));
        QVERIFY(Screen::shows("PHONE.Keypad"));
        for (const char* const key : {"key1", "key2", "key0", "key#", "backspace"})
            QVERIFY(Screen::tap(key));
        QCOMPARE(Screen::text("dialledNumber"), QStringLiteral("120"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("dial"));
        QTRY_VERIFY(!BridgeTester::calls().isEmpty());
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("PhoneSource.dial(\"120\")")});
    }

    void nightAndDayFollowTheLightOutsideUntilTheDriverChooses()
    {
        auto* const theme =
            HmiGuiFramework::DataStore::get<HmiGuiFramework::UiThemeManager>(QStringLiteral("UiThemeManager"));
        QCOMPARE(theme->palette(), QStringLiteral("day"));
        BridgeTester::setState("GlobalSource", {{"nightMode", true}});
        QCOMPARE(theme->palette(), QStringLiteral("night"));
        QVERIFY(open("SETTINGS.Display"));
        QVERIFY(Screen::tap("palette1"));
        QCOMPARE(theme->palette(), QStringLiteral("day"));
        QVERIFY(Screen::tap("palette0"));
        QCOMPARE(theme->palette(), QStringLiteral("night"));
    }

    void aMasterResetLeadsToTheHomeModule()
    {
        QVERIFY(open("SETTINGS.About"));
        HmiCore::HmiManager::instance()->reportMasterReset();
        QVERIFY(Screen::shows("RADIO.Main"));
    }

    void aDisabledModuleLeavesTheLauncher()
    {
        auto* const module = qApp->findChild<HmiCore::HmiModuleIntegration*>();
        QVERIFY(module);
        const QByteArray tile = "tile" + module->moduleId().toLatin1();
        QVERIFY(Screen::find(tile.constData()));
        module->setEnabled(false);
        QVERIFY(!Screen::find(tile.constData()));
        module->setEnabled(true);
        QVERIFY(Screen::find(tile.constData()));
    }

    void aBlockedModuleCannotBeOpenedFromTheLauncher()
    {
        for (auto* const module : qApp->findChildren<HmiCore::HmiModuleIntegration*>())
            module->setProperty("blocked", true);
        QVERIFY(Screen::tap("tilePHONE"));
        QVERIFY(Screen::tap("railPHONE"));
        QCoreApplication::processEvents();
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("SYSTEM.Launcher"));
        for (auto* const module : qApp->findChildren<HmiCore::HmiModuleIntegration*>())
            module->setProperty("blocked", false);
        QVERIFY(Screen::tap("tilePHONE"));
        QVERIFY(Screen::shows("PHONE.Main"));
    }

    /// Whatever comes with a request, it is performed or refused, and the HMI goes on. The last test: it leaves popups.
    void intentsWithOddDataDoNoHarm()
    {
        const QList<QList<QVariant>> oddData{{},
                                             {QVariant()},
                                             {QStringLiteral("text"), QStringLiteral("text")},
                                             {-1, 1 << 30},
                                             {QVariantList{1, QVariantMap()}, QVariantMap{{QString(), 1}}},
                                             {QString(100000, QLatin1Char('9'))},
                                             {QVariant::fromValue(static_cast<QObject*>(this))}};
        for (int intent = -1; intent <= HmiIntentManager::UserType; ++intent) {
            for (const QList<QVariant>& data : oddData)
                HmiIntentManager::instance()->requestAction(intent, data, intent % 2 == 0);
            QCoreApplication::processEvents();
        }
        BridgeTester::resetState();
        m_log->take(QStringLiteral("kest.hmicore"), QtWarningMsg); // one for each that was refused
        QVERIFY(open("RADIO.Main"));
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<HeadUnitTest>(argc, argv);
}

#include "tst_headunit.moc"
