// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/PhoneSource>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/StateMachine>
#include <HmiVehicle/embeddedvehicle.h>

#include <memory>

using AL2HMIBridge::BridgeConnection;
using AL2HMIBridge::BridgeEndpoint;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::StateMachine;
using HmiVehicle::EmbeddedVehicle;
using HmiVehicle::Vehicle;

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

    static bool isSynchronised()
    {
        return QTest::qWaitFor([] { return BridgeConnection::instance()->synchronised(); }, 20000);
    }

    std::unique_ptr<LogCapture> m_log;

private Q_SLOTS:
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
