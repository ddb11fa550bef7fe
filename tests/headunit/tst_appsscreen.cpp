// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include "../../headunit/modules/modulekeys.h"

#include <HmiCore/HmiIntentManager>
#include <HmiStateMachine/StateMachine>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiStateMachine::StateMachine;

/// The projected phone and the modules on the screen of all apps.
class AppsScreenTest : public QObject
{
    Q_OBJECT

    static bool project(int mode)
    {
        return BridgeTester::setState("ProjectionSource",
                                      {{"projectionMode", mode}, {"projectedDeviceName", QStringLiteral("A phone")}});
    }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        StateMachine::instance()->sendKeySignal(QStringLiteral("Home"));
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        QVERIFY(BridgeTester::sendEvent("KeySource", "keyEvent", {int(ModuleKey::Apps), 0}));
        QVERIFY(Screen::shows("APPS.Main"));
    }

    void cleanup()
    {
        m_vehicle.reset();
        m_log.reset();
    }

    void thePhoneIsShownWhileItIsThere()
    {
        QCOMPARE(Screen::text("appsPhone"), QStringLiteral("No phone is projected"));
        QVERIFY(Screen::find("appsHint") && !Screen::find("showPhoneScreen"));
        QVERIFY(project(1));
        QCOMPARE(Screen::text("appsPhone"), QStringLiteral("A phone"));
        QCOMPARE(Screen::text("appsPhoneKind"), QStringLiteral("On the cable"));
        QVERIFY(!Screen::find("appsHint"));
        QVERIFY(project(2));
        QCOMPARE(Screen::text("appsPhoneKind"), QStringLiteral("Without cable"));
        QVERIFY(Screen::tap("showPhoneScreen"));
        QVERIFY(Screen::shows("SYSTEM.Projection"));
        QVERIFY(project(0));
        QVERIFY(Screen::shows("SYSTEM.Launcher")); // its screen has gone
    }

    void whatItPlaysIsNamed()
    {
        QVERIFY(project(2));
        QVERIFY(!Screen::find("appsPhoneSong"));
        QVERIFY(BridgeTester::setState("ProjectionSource",
                                       {{"projectedPlaying", true}, {"projectedTitle", QStringLiteral("A song")}}));
        QCOMPARE(Screen::text("appsPhoneSong"), QStringLiteral("A song"));
    }

    void theMarketMayOfferNone()
    {
        const QString hint = Screen::text("appsHint");
        QVERIFY(BridgeTester::setState("GlobalSource", {{"destinationCountry", 0x9C}})); // China
        QTRY_VERIFY(Screen::text("appsHint") != hint);
    }

    void modulesBeyondTheFirstRowAreApps()
    {
        QStringList apps;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->objectName().startsWith(QLatin1String("app")) && item->property("iconUrl").isValid())
                apps.append(item->objectName());
        });
        QCOMPARE(apps,
                 QStringList({QStringLiteral("appMEDIA"), QStringLiteral("appPHONE"), QStringLiteral("appCLIMATE"),
                              QStringLiteral("appMESSAGES"), QStringLiteral("appSETTINGS")}));
        QVERIFY(Screen::tap("appPHONE"));
        QVERIFY(Screen::shows("PHONE.Main"));
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<AppsScreenTest>(argc, argv);
}

#include "tst_appsscreen.moc"
