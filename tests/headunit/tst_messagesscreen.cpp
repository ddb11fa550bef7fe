// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include "../../headunit/modules/modulekeys.h"
#include "moduleintents.h"

#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/StatusBarController>
#include <HmiStateMachine/StateMachine>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiIntentManager;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiStateMachine::StateMachine;

/// Messages from their arrival to what a driver does with them.
class MessagesScreenTest : public QObject
{
    Q_OBJECT

    static bool open(const char* view)
    {
        return Screen::views()->requestView(QString::fromLatin1(view)) && Screen::shows(view);
    }

    static bool send(const char* sender, const char* number = "", const char* place = "")
    {
        const bool accepted = HmiIntentManager::instance()->requestAction(
            ModuleIntent::AddMessage, {QString::fromUtf8(sender), QStringLiteral("Shall we meet?"),
                                       QString::fromLatin1(number), QString::fromUtf8(place)});
        QCoreApplication::processEvents();
        return accepted;
    }

    static StatusBarController* statusBar()
    {
        return DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"));
    }

    static QString markOf(const char* tile)
    {
        QString text;
        Screen::visit(Screen::find(tile), [&](QQuickItem* item) {
            if (item->objectName() == QLatin1String("mark"))
                text = item->property("text").toString();
        });
        return text;
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
        QVERIFY(BridgeTester::setState("GlobalSource", {{"outsideTemperature", 20}}));
    }

    void cleanup()
    {
        QVERIFY(open("MESSAGES.Main"));
        while (Screen::find("message0")) {
            QVERIFY(Screen::tap("message0"));
            QVERIFY(Screen::shows("MESSAGES.Detail"));
            QVERIFY(Screen::tap("messageRemove"));
            QVERIFY(Screen::shows("MESSAGES.Main"));
        }
        statusBar()->dismissTransient();
        m_vehicle.reset();
        m_log.reset();
    }

    void anArrivalIsToldAndCounted()
    {
        QCOMPARE(markOf("tileMESSAGES"), QString());
        QVERIFY(send("Ada"));
        QTRY_COMPARE(statusBar()->transient(), QStringLiteral("MESSAGES.Arrived"));
        QVERIFY(Screen::isDrawn());
        QCOMPARE(Screen::text("arrivedText"), QStringLiteral("Ada"));
        QVERIFY(send("Ben"));
        QTRY_COMPARE(markOf("tileMESSAGES"), QStringLiteral("2"));
        statusBar()->dismissTransient();
        QVERIFY(open("MESSAGES.Main"));
        QVERIFY(send("Cora"));
        QCOMPARE(statusBar()->transient(), QString()); // it is seen in the list
        QVERIFY(Screen::isDrawn());
        QVERIFY(Screen::find("unreadMark"));
        QVERIFY(Screen::tap("message0"));
        QVERIFY(Screen::shows("MESSAGES.Detail"));
        QCOMPARE(Screen::text("messageSender"), QStringLiteral("Cora"));
        QCOMPARE(Screen::text("messageText"), QStringLiteral("Shall we meet?"));
        QVERIFY(open("SYSTEM.Launcher"));
        QCOMPARE(markOf("tileMESSAGES"), QStringLiteral("2"));
    }

    void aSenderIsCalledBack()
    {
        QVERIFY(send("Ada", "+1 555 0100"));
        QVERIFY(open("MESSAGES.Main"));
        QVERIFY(Screen::tap("message0"));
        QVERIFY(Screen::shows("MESSAGES.Detail"));
        QVERIFY(!Screen::find("messageNavigate"));
        BridgeTester::takeCalls();
        QVERIFY(Screen::tap("messageCall")); // no phone is there
        QCoreApplication::processEvents();
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
        QVERIFY(BridgeTester::setState("PhoneSource", {{"deviceName", QStringLiteral("A phone")}}));
        QVERIFY(Screen::tap("messageCall"));
        QCoreApplication::processEvents();
        QCOMPARE(BridgeTester::takeCalls(), QStringList{QStringLiteral("PhoneSource.dial(\"+1 555 0100\")")});
    }

    void aPlaceIsDrivenTo()
    {
        QVERIFY(send("Ada", "", "Café Lantern"));
        QVERIFY(open("MESSAGES.Main"));
        QVERIFY(Screen::tap("message0"));
        QVERIFY(Screen::shows("MESSAGES.Detail"));
        QVERIFY(!Screen::find("messageCall"));
        QVERIFY(Screen::tap("messageNavigate"));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        QCOMPARE(Screen::text("statusTitle"), QStringLiteral("Café Lantern"));
        QVERIFY(Screen::tap("stopGuidance"));
    }

    void aTextIsAnswered()
    {
        QVERIFY(send("Ada"));
        QVERIFY(open("MESSAGES.Main"));
        QVERIFY(Screen::tap("message0"));
        QVERIFY(Screen::shows("MESSAGES.Detail"));
        QCOMPARE(Screen::text("messageAnswer"), QString());
        QVERIFY(Screen::tap("answer1"));
        QVERIFY(Screen::isDrawn());
        QCOMPARE(Screen::text("messageAnswer"), QStringLiteral("Answered: I am on my way."));
        QVERIFY(!Screen::find("answer1"));
    }

    void anEmptyMessageIsRefused()
    {
        QVERIFY(!HmiIntentManager::instance()->requestAction(ModuleIntent::AddMessage,
                                                             {QStringLiteral("Ada"), QStringLiteral(" ")}));
        m_log->take(QStringLiteral("kest.hmicore"), QtWarningMsg);
        QTRY_COMPARE(Screen::text("noticeText"), QStringLiteral("There is nothing in this message"));
    }

    void aMissedCallIsToldByTheVehicle()
    {
        QVERIFY(BridgeTester::setState("GlobalSource", {{"clockText", QStringLiteral("10:42")}}));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"deviceName", QStringLiteral("A phone")},
                                                       {"batteryLevel", 80},
                                                       {"incomingCall", true},
                                                       {"callerName", QStringLiteral("Ada Martin")}}));
        QTRY_COMPARE(Screen::views()->currentPopup(), QStringLiteral("PHONE.IncomingCall"));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"incomingCall", false}}));
        QTRY_COMPARE(Screen::views()->currentPopup(), QString());
        QVERIFY(BridgeTester::sendEvent("KeySource", "keyEvent", {int(ModuleKey::Messages), 0}));
        QVERIFY(Screen::shows("MESSAGES.Main"));
        QCOMPARE(Screen::find("message0")->property("title").toString(), QStringLiteral("Ada Martin"));
        QCOMPARE(Screen::find("message0")->property("subtitle").toString(), QStringLiteral("Missed call"));
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<MessagesScreenTest>(argc, argv);
}

#include "tst_messagesscreen.moc"
