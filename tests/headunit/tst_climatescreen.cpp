// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include "../../headunit/modules/modulekeys.h"

#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/StatusBarController>
#include <HmiStateMachine/StateMachine>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiIntentManager;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiStateMachine::StateMachine;

/// The climate control in the head unit: by touch, by hard keys and by intents.
class ClimateScreenTest : public QObject
{
    Q_OBJECT

    static bool open(const char* view)
    {
        return Screen::views()->requestView(QString::fromLatin1(view)) && Screen::shows(view);
    }

    static QString transient()
    {
        return DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"))->transient();
    }

    static bool press(int key)
    {
        return BridgeTester::sendEvent("KeySource", "keyEvent", {key, 0})
               && BridgeTester::sendEvent("KeySource", "keyEvent", {key, 2});
    }

    static bool isOn(const char* key) { return Screen::find(key)->property("on").toBool(); }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        StateMachine::instance()->sendKeySignal(QStringLiteral("Home"));
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        QVERIFY(BridgeTester::setState("GlobalSource", {{"destinationCountry", 0x114}, {"outsideTemperature", 21.5}}));
    }

    void cleanup()
    {
        HmiIntentManager::instance()->requestAction(HmiIntentManager::UserType, {21.5, 0});
        QCoreApplication::processEvents();
        DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"))->dismissTransient();
        m_vehicle.reset();
        m_log.reset();
    }

    void bothSidesAreSetByTouch()
    {
        QVERIFY(open("CLIMATE.Main"));
        QCOMPARE(Screen::text("driverTemperature"), QStringLiteral("21.5"));
        QVERIFY(Screen::tap("driverWarmer"));
        QCOMPARE(Screen::text("driverTemperature"), QStringLiteral("22.0"));
        QCOMPARE(Screen::text("passengerTemperature"), QStringLiteral("22.0"));
        QVERIFY(Screen::tap("passengerCooler"));
        QCOMPARE(Screen::text("passengerTemperature"), QStringLiteral("21.5"));
        QVERIFY(!isOn("climateSync"));
        QVERIFY(Screen::tap("climateSync"));
        QCOMPARE(Screen::text("passengerTemperature"), QStringLiteral("22.0"));
        QCOMPARE(transient(), QString()); // the screen shows it already
    }

    void fanAndAirAreSetByTouch()
    {
        QVERIFY(open("CLIMATE.Main"));
        QVERIFY(isOn("climateAuto"));
        QVERIFY(Screen::tap("fanMore"));
        QVERIFY(!isOn("climateAuto"));
        QCOMPARE(Screen::text("climateState"), QStringLiteral("By hand"));
        QVERIFY(Screen::tap("airFeet"));
        QVERIFY(isOn("airFeet"));
        QVERIFY(Screen::tap("climateDefrost"));
        QVERIFY(isOn("airWindscreen") && !isOn("airFeet"));
        QCOMPARE(Screen::text("climateState"), QStringLiteral("Defrosting"));
        QVERIFY(Screen::tap("climateDefrost"));
        QVERIFY(isOn("airFeet"));
        QVERIFY(Screen::tap("climatePower"));
        QCOMPARE(Screen::text("climateState"), QStringLiteral("Off"));
        QVERIFY(Screen::tap("climateAuto"));
        QVERIFY(isOn("climatePower") && isOn("climateAuto"));
    }

    void temperaturesAreInTheMarketsUnit()
    {
        QVERIFY(open("CLIMATE.Main"));
        QVERIFY(BridgeTester::setState("GlobalSource", {{"destinationCountry", 0x348}}));
        QCOMPARE(Screen::text("driverTemperature"), QStringLiteral("71"));
        QVERIFY(Screen::tap("driverWarmer"));
        QCOMPARE(Screen::text("driverTemperature"), QStringLiteral("72"));
        QVERIFY(Screen::tap("driverCooler") && Screen::tap("driverCooler"));
        QCOMPARE(Screen::text("driverTemperature"), QStringLiteral("70"));
    }

    void hardKeysTellOnOtherScreensWhatTheyChanged()
    {
        QVERIFY(press(ModuleKey::WarmerDriver));
        QTRY_COMPARE(transient(), QStringLiteral("CLIMATE.Change"));
        QVERIFY(Screen::isDrawn());
        QCOMPARE(Screen::text("climateNoticeText"), QStringLiteral("Temperature"));
        QCOMPARE(Screen::text("climateNoticeValue"), QStringLiteral("22.0 °C"));
        QVERIFY(press(ModuleKey::Defrost));
        QCOMPARE(Screen::text("climateNoticeText"), QStringLiteral("Windscreen"));
        QCOMPARE(Screen::text("climateNoticeValue"), QStringLiteral("On"));
        QVERIFY(press(ModuleKey::Defrost));
        QCOMPARE(Screen::text("climateNoticeValue"), QStringLiteral("Off"));
        QVERIFY(press(ModuleKey::Climate));
        QVERIFY(Screen::shows("CLIMATE.Main"));
    }

    void aHeldKeyGoesOn()
    {
        QVERIFY(BridgeTester::sendEvent("KeySource", "keyEvent", {int(ModuleKey::CoolerDriver), 0}));
        for (const int state : {3, 1, 1, 4}) // held, two steps, let go
            QVERIFY(BridgeTester::sendEvent("KeySource", "keyEvent", {int(ModuleKey::CoolerDriver), state}));
        QVERIFY(open("CLIMATE.Main"));
        QCOMPARE(Screen::text("driverTemperature"), QStringLiteral("20.0"));
    }

    void hardKeysRestInValetModeAndStandby_data()
    {
        QTest::addColumn<QByteArray>("source");
        QTest::addColumn<QVariantMap>("state");
        QTest::newRow("valet mode") << QByteArray("ValetModeSource")
                                    << QVariantMap{{QStringLiteral("valetModeEnabled"), true}};
        QTest::newRow("standby") << QByteArray("GlobalSource") << QVariantMap{{QStringLiteral("powerOn"), false}};
    }

    void hardKeysRestInValetModeAndStandby()
    {
        QFETCH(QByteArray, source);
        QFETCH(QVariantMap, state);
        QVERIFY(BridgeTester::setState(QString::fromLatin1(source), state));
        QVERIFY(press(ModuleKey::WarmerDriver) && press(ModuleKey::Climate));
        QCoreApplication::processEvents();
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("SYSTEM.Launcher"));
        QCOMPARE(transient(), QString());
    }

    void anIntentSetsATemperatureThatThereIs_data()
    {
        QTest::addColumn<QVariantList>("data");
        QTest::addColumn<QString>("driver");
        QTest::addColumn<QString>("passenger");
        QTest::newRow("driver") << QVariantList{23.5} << QStringLiteral("23.5") << QStringLiteral("23.5");
        QTest::newRow("passenger") << QVariantList{18, 1} << QStringLiteral("21.5") << QStringLiteral("18.0");
        QTest::newRow("too warm") << QVariantList{40} << QStringLiteral("21.5") << QStringLiteral("21.5");
        QTest::newRow("no number") << QVariantList{QStringLiteral("warm")} << QStringLiteral("21.5")
                                   << QStringLiteral("21.5");
    }

    void anIntentSetsATemperatureThatThereIs()
    {
        QFETCH(QVariantList, data);
        QFETCH(QString, driver);
        QVERIFY(open("CLIMATE.Main"));
        if (!isOn("climateSync"))
            QVERIFY(Screen::tap("climateSync"));
        const bool isDone = HmiIntentManager::instance()->requestAction(HmiIntentManager::UserType, data);
        QCoreApplication::processEvents();
        QCOMPARE(Screen::text("driverTemperature"), driver);
        QTEST(Screen::text("passengerTemperature"), "passenger");
        QCOMPARE(isDone,
                 qstrncmp(QTest::currentDataTag(), "too", 3) != 0 && qstrncmp(QTest::currentDataTag(), "no", 2) != 0);
        if (!isDone)
            m_log->take(QStringLiteral("kest.hmicore"), QtWarningMsg);
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<ClimateScreenTest>(argc, argv);
}

#include "tst_climatescreen.moc"
