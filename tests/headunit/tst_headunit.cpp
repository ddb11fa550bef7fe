// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <HmiCore/HmiModuleIntegration>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/StateMachine>

#include <memory>

using AL2HMIBridge::BridgeTester;
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
        QCOMPARE(tiles, QStringList({QStringLiteral("tileRADIO"), QStringLiteral("tilePHONE"),
                                     QStringLiteral("tileSETTINGS")}));
        QVERIFY(Screen::find("tileRADIO")->property("isHome").toBool());
        QVERIFY(!Screen::find("tilePHONE")->property("isHome").toBool());
    }

    void aTileOpensItsModule_data()
    {
        QTest::addColumn<QByteArray>("tile");
        QTest::addColumn<QByteArray>("view");
        QTest::addColumn<QString>("title");
        QTest::newRow("radio") << QByteArray("tileRADIO") << QByteArray("RADIO.Main") << QStringLiteral("Radio");
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
                                                 {"activePreset", 2},
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

    void theSettingsMenuHasThePagesOfOtherModulesInOrder()
    {
        QVERIFY(open("SETTINGS.Main"));
        QStringList pages;
        for (const char* const name : {"page0", "page1", "page2"})
            pages.append(Screen::find(name) ? Screen::find(name)->property("title").toString() : QString());
        QCOMPARE(pages, QStringList({QStringLiteral("Display"), QStringLiteral("Phone"), QStringLiteral("About")}));
        QVERIFY(!Screen::find("page3"));
        QVERIFY(Screen::tap("page1"));
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
};

int main(int argc, char** argv)
{
    return runInHeadUnit<HeadUnitTest>(argc, argv);
}

#include "tst_headunit.moc"
