// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentMonitor>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiStateMachine/StateMachine>

#include <QRegularExpression>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiIntentManager;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiStateMachine::StateMachine;

/// The navigation in the head unit: from a destination to the turns that other screens show.
class NavigationTest : public QObject
{
    Q_OBJECT

    static bool open(const char* view)
    {
        return Screen::views()->requestView(QString::fromLatin1(view)) && Screen::shows(view);
    }

    static bool request(int intent, const QList<QVariant>& data = {})
    {
        return HmiIntentManager::instance()->requestAction(intent, data);
    }

    static QString transient()
    {
        return DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"))->transient();
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
    }

    void cleanup()
    {
        QVERIFY(open("NAVIGATION.Main"));
        if (Screen::find("stopGuidance"))
            QVERIFY(Screen::tap("stopGuidance"));
        m_vehicle.reset();
        m_log.reset();
    }

    void aPlaceIsChosenByItsKindAndGuidedTo()
    {
        QVERIFY(open("NAVIGATION.Main"));
        QVERIFY(!Screen::find("turnStreet"));
        QVERIFY(Screen::tap("quickCategory3"));
        QVERIFY(Screen::shows("NAVIGATION.Destinations"));
        QVERIFY(Screen::find("placeKind3")->property("selected").toBool());
        const QString nearest = Screen::find("place0")->property("title").toString();
        QVERIFY(nearest.contains(QLatin1String("Fuel")));
        QVERIFY(Screen::tap("place0"));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        QCOMPARE(Screen::text("statusTitle"), nearest);
        QVERIFY(!Screen::text("turnDistance").isEmpty());
        QVERIFY(Screen::tap("showRoute"));
        QVERIFY(Screen::shows("NAVIGATION.Route"));
        QVERIFY(Screen::find("step0")->property("selected").toBool());
        QCOMPARE(Screen::text("routeDestination"), nearest);
        QVERIFY(Screen::tap("railBack"));
        QVERIFY(Screen::tap("stopGuidance"));
        QVERIFY(Screen::isDrawn());
        QVERIFY(!Screen::find("turnStreet"));
        QCOMPARE(Screen::text("statusTitle"), QStringLiteral("Navigation"));
    }

    void otherModulesAskForGuidanceByAName()
    {
        QVERIFY(request(HmiIntentManager::Navigate, {QStringLiteral("merrow castle")}));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        QCOMPARE(Screen::text("statusTitle"), QStringLiteral("Merrow Castle"));
        QVERIFY(request(HmiIntentManager::Navigate));
        QVERIFY(Screen::shows("NAVIGATION.Destinations"));
    }

    void aPlaceThatIsNotOnTheMapIsTold()
    {
        QVERIFY(!request(HmiIntentManager::Navigate, {QStringLiteral("Atlantis")}));
        m_log->take(QStringLiteral("kest.hmicore"), QtWarningMsg);
        QTRY_COMPARE(Screen::text("noticeText"), QStringLiteral("The map does not have this place"));
        QCOMPARE(Screen::views()->currentView(), QStringLiteral("SYSTEM.Launcher"));
    }

    void theRouteCanBeShownWhileThereIsOne()
    {
        auto* const monitor = HmiIntentManager::instance()->intentMonitor(HmiIntentManager::ShowNavWaypoints);
        QVERIFY(!monitor->enabled());
        QVERIFY(request(HmiIntentManager::Navigate, {QStringLiteral("Ferry Terminal")}));
        QTRY_VERIFY(monitor->enabled());
        QVERIFY(request(HmiIntentManager::ShowNavWaypoints));
        QVERIFY(Screen::shows("NAVIGATION.Route"));
    }

    void turnsAreShownOnOtherScreens()
    {
        QVERIFY(!Screen::find("turnChip"));
        QVERIFY(request(HmiIntentManager::Navigate, {QStringLiteral("Merrow Castle")}));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        QVERIFY(!Screen::find("turnChip"));
        const QString distance = Screen::text("turnDistance");
        QVERIFY(open("MEDIA.Main"));
        QTRY_COMPARE(Screen::text("turnChip"), distance);
        QVERIFY(Screen::tap("turnChip"));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        QTRY_VERIFY(!Screen::find("turnChip"));
    }

    void theDemonstrationAnnouncesTheNearTurn()
    {
        QVERIFY(request(HmiIntentManager::Navigate, {QStringLiteral("Silver Spoon")}));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        QVERIFY(Screen::tap("toggleDrive"));
        QVERIFY(open("MEDIA.Main"));
        QTRY_COMPARE_WITH_TIMEOUT(transient(), QStringLiteral("NAVIGATION.Turn"), 60000);
        QTRY_VERIFY(!Screen::text("turnTransientDistance").isEmpty());
    }

    void thePageInTheSettingsKeepsTurnsToTheMap()
    {
        QVERIFY(request(HmiIntentManager::Navigate, {QStringLiteral("Merrow Castle")}));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        QVERIFY(request(HmiIntentManager::NavigationSettings));
        QVERIFY(Screen::shows("SETTINGS.Navigation.Main"));
        QTRY_VERIFY(Screen::find("turnChip"));
        QVERIFY(Screen::tap("turnsElsewhere"));
        QTRY_VERIFY(!Screen::find("turnChip"));
        QVERIFY(Screen::tap("turnsElsewhere"));
        QTRY_VERIFY(Screen::find("turnChip"));
    }

    void theMapIsMovedByAFingerAndComesBack()
    {
        QVERIFY(open("NAVIGATION.Main"));
        QVERIFY(!Screen::find("followVehicle"));
        const QPointF before = Screen::find("map")->property("vehicle").toPointF();
        const QPoint finger(900, 300);
        QTest::mousePress(Screen::window(), Qt::LeftButton, Qt::NoModifier, finger);
        QTest::mouseMove(Screen::window(), finger + QPoint(60, 40));
        QTest::mouseRelease(Screen::window(), Qt::LeftButton, Qt::NoModifier, finger + QPoint(60, 40));
        QCOMPARE(Screen::find("map")->property("vehicle").toPointF(), before + QPointF(60, 40));
        QVERIFY(Screen::tap("followVehicle"));
        QCOMPARE(Screen::find("map")->property("vehicle").toPointF(), before);
        const double zoom = Screen::find("map")->property("zoom").toDouble();
        QVERIFY(Screen::tap("zoomIn"));
        QVERIFY(Screen::find("map")->property("zoom").toDouble() > zoom);
        QVERIFY(Screen::tap("zoomOut"));
        QCOMPARE(Screen::find("map")->property("zoom").toDouble(), zoom);
    }

    void distancesAreThoseOfTheMarket_data()
    {
        QTest::addColumn<int>("country");
        QTest::addColumn<QString>("units");
        QTest::newRow("Germany") << 0x114 << QStringLiteral("k?m");
        QTest::newRow("United Kingdom") << 0x33A << QStringLiteral("yd|mi");
        QTest::newRow("United States") << 0x348 << QStringLiteral("ft|mi");
    }

    void distancesAreThoseOfTheMarket()
    {
        QFETCH(int, country);
        QFETCH(QString, units);
        QVERIFY(BridgeTester::setState("GlobalSource", {{"destinationCountry", country}}));
        QVERIFY(request(HmiIntentManager::Navigate, {QStringLiteral("Merrow Castle")}));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        const QRegularExpression expected(QStringLiteral("^[0-9.,]+ (%1)$").arg(units));
        QVERIFY2(expected.match(Screen::text("turnDistance")).hasMatch(), qPrintable(Screen::text("turnDistance")));
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<NavigationTest>(argc, argv);
}

#include "tst_navigation.moc"
