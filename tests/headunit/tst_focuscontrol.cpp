// SPDX-License-Identifier: MIT
#include "focuscontrol.h"
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <HmiGuiFramework/AppSettings>
#include <HmiStateMachine/StateMachine>

#include <QGuiApplication>

#include <memory>

using AL2HMIBridge::BridgeTester;

/// Every screen is used with the tune knob alone.
class FocusControlTest : public QObject
{
    Q_OBJECT

    static constexpr int tuneUp = 54;
    static constexpr int tuneDown = 55;
    static constexpr int tunePress = 110;

    static QString text(const char* utf8) { return QString::fromUtf8(utf8); }

    static FocusControl* control() { return qApp->findChild<FocusControl*>(); }

    static QString focusedName() { return control()->item() ? control()->item()->objectName() : QString(); }

    /// As the vehicle tells of the knob.
    static void press()
    {
        BridgeTester::sendEvent("KeySource", "keyEvent", {tunePress, 0});
        BridgeTester::sendEvent("KeySource", "keyEvent", {tunePress, 2});
    }

    static void turn(int key)
    {
        for (const int state : {0, 1, 2})
            BridgeTester::sendEvent("KeySource", "keyEvent", {key, state});
    }

    static void fillContacts(int count)
    {
        QVariantList contacts;
        for (int i = 0; i < count; ++i)
            contacts.append(
                QVariantMap{{text("name"), QStringLiteral("Person %1").arg(i)}, {text("number"), text("1")}});
        BridgeTester::setState("PhoneSource", {{"contacts", contacts}, {"deviceName", text("A phone")}});
    }

    static bool open(const QString& name)
    {
        auto* const views = Screen::views();
        if (views->guiDescriptor().popups.contains(name))
            return views->requestPopup(name) && Screen::isDrawn();
        return views->requestView(name) && Screen::shows(qPrintable(name));
    }

    static bool find(const char* objectName)
    {
        for (int i = 0; i < 200; ++i) {
            if (focusedName() == QLatin1String(objectName))
                return true;
            const QQuickItem* const before = control()->item();
            turn(tuneUp);
            if (!Screen::isDrawn() || control()->item() == before)
                return false;
        }
        return false;
    }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        QVERIFY(!control()->isInUse());
        BridgeTester::takeCalls();
    }

    void cleanup()
    {
        control()->leave();
        m_vehicle.reset();
        Screen::views()->requestView(text("SYSTEM.Launcher"));
        m_log.reset();
    }

    void aPressBeginsAndTheVehicleStopsTuning()
    {
        turn(tuneUp);
        QVERIFY(!control()->isInUse());
        QVERIFY(!control()->item());
        BridgeTester::takeCalls();
        press();
        QVERIFY(control()->isInUse());
        QVERIFY(control()->item());
        QVERIFY(control()->item()->property("focused").toBool());
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("GlobalSource.reserveTuneKnob(true)")});
        control()->leave();
        QVERIFY(!control()->item());
        QCOMPARE(BridgeTester::takeCalls(), QStringList{text("GlobalSource.reserveTuneKnob(false)")});
        control()->leave();
        QCOMPARE(BridgeTester::takeCalls(), QStringList());
    }

    void aTouchEndsIt()
    {
        press();
        QTest::mouseClick(Screen::window(), Qt::LeftButton, Qt::NoModifier, QPoint(700, 30));
        QVERIFY(!control()->isInUse());
        QVERIFY(!control()->item());
    }

    void stepsGoOnAndBackAndEndAtTheEnds()
    {
        press();
        QQuickItem* const first = control()->item();
        turn(tuneDown);
        QCOMPARE(control()->item(), first);
        turn(tuneUp);
        QVERIFY(control()->item() != first);
        QVERIFY(!first->property("focused").toBool());
        turn(tuneDown);
        QCOMPARE(control()->item(), first);
    }

    void aTileIsOpenedAndTheKnobIsOnTheNewScreen()
    {
        press();
        QVERIFY(find("tileSETTINGS"));
        press();
        QVERIFY(Screen::shows("SETTINGS.Main"));
        QTRY_VERIFY(focusedName().startsWith(text("page")));
        QVERIFY(control()->item()->isVisible());
    }

    void aPopupKeepsTheKnob()
    {
        press();
        QVERIFY(Screen::views()->requestPopup(text("SYSTEM.AudioSources")));
        QTRY_VERIFY(focusedName().startsWith(text("source")) || focusedName() == text("dismissPopup"));
        for (int i = 0; i < 40; ++i)
            turn(tuneUp);
        QVERIFY2(focusedName().startsWith(text("source")), qPrintable(focusedName()));
        Screen::views()->closePopup(text("SYSTEM.AudioSources"));
        QTRY_VERIFY(!focusedName().startsWith(text("source")));
    }

    void aSliderIsTurned()
    {
        QVERIFY(open(text("SETTINGS.Sound.Main")));
        BridgeTester::setState("GlobalSource", {{"volume", 10}});
        press();
        while (control()->item() && control()->item()->metaObject()->indexOfMethod("adjust(QVariant)") < 0) {
            const QQuickItem* const before = control()->item();
            turn(tuneUp);
            QVERIFY(control()->item() != before);
        }
        QQuickItem* const slider = control()->item();
        BridgeTester::takeCalls();
        press();
        QVERIFY(control()->isAdjusting());
        turn(tuneUp);
        QCOMPARE(control()->item(), slider);
        QVERIFY(BridgeTester::takeCalls().contains(text("GlobalSource.setVolume(12)")));
        press();
        QVERIFY(!control()->isAdjusting());
        turn(tuneUp);
        QVERIFY(control()->item() != slider);
    }

    void longListsScrollWithIt()
    {
        fillContacts(60);
        QVERIFY(open(text("PHONE.Main")));
        press();
        QVERIFY(find("contact59"));
        const QQuickItem* const list = Screen::find("contacts");
        const QQuickItem* const item = control()->item();
        QVERIFY(QRectF(0, 0, list->width(), list->height() + 1)
                    .contains(item->mapRectToItem(list, QRectF(0, 0, item->width(), item->height()))));
    }

    void aListThatIsFilledAnewKeepsTheKnobInItsPlace()
    {
        fillContacts(20);
        QVERIFY(open(text("PHONE.Main")));
        press();
        QVERIFY(find("contact2"));
        const QPointer<QQuickItem> item = control()->item();
        fillContacts(21);
        QTRY_VERIFY(!item);
        QVERIFY(Screen::isDrawn());
        turn(tuneUp);
        QCOMPARE(focusedName(), text("contact3"));
    }

    void longListsEndEarlyWhileDriving()
    {
        fillContacts(60);
        QVERIFY(open(text("PHONE.Main")));
        QQuickItem* const list = Screen::find("contacts");
        list->setProperty("contentY", 2000);
        QCOMPARE(list->property("contentY").toDouble(), 2000.0);
        QVERIFY(!Screen::find("endsEarly"));
        BridgeTester::setState("GlobalSource", {{"vehicleSpeed", 50}});
        QTRY_VERIFY(Screen::find("endsEarly"));
        QVERIFY(list->property("contentY").toDouble() < 800);
        list->setProperty("contentY", 3000);
        QVERIFY(list->property("contentY").toDouble() < 800);
        press();
        QVERIFY(find("contact8"));
        QVERIFY(!find("contact12"));
        BridgeTester::setState("GlobalSource", {{"vehicleSpeed", 0}});
        QTRY_VERIFY(!Screen::find("endsEarly"));
        list->setProperty("contentY", 2000);
        QCOMPARE(list->property("contentY").toDouble(), 2000.0);
    }

    /// Whatever can be touched can be reached.
    void everythingIsReached_data()
    {
        QTest::addColumn<QString>("view");
        QTRY_VERIFY(!Screen::views()->guiDescriptor().views.isEmpty());
        const auto descriptor = Screen::views()->guiDescriptor();
        QStringList names = descriptor.views.keys() + descriptor.popups.keys();
        names.sort();
        for (const QString& name : std::as_const(names))
            QTest::newRow(qPrintable(name)) << name;
    }
    void everythingIsReached()
    {
        QFETCH(QString, view);
        BridgeTester::setState("PhoneSource", {{"deviceName", text("A phone")}});
        QVERIFY(open(view));
        QSet<const QQuickItem*> reached;
        press();
        while (control()->item() && !reached.contains(control()->item())) {
            reached.insert(control()->item());
            turn(tuneUp);
            QVERIFY(Screen::isDrawn());
        }
        const bool isPopup = !Screen::views()->currentPopup().isEmpty();
        const QQuickItem* popups = nullptr;
        if (isPopup && !reached.isEmpty())
            for (const QQuickItem* item = *reached.constBegin(); item; item = item->parentItem())
                if (item->property("popupData").isValid())
                    popups = item;
        QStringList missed;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* area) {
            if (area->objectName() != QLatin1String("touchArea") || !area->property("enabled").toBool()
                || area->width() <= 0)
                return;
            bool isReached = false;
            bool isOnPopup = false;
            for (const QQuickItem* item = area; item; item = item->parentItem()) {
                isReached |= reached.contains(item);
                isOnPopup |= item == popups;
            }
            if (!isReached && (!isPopup || isOnPopup))
                missed.append(Screen::pathOf(area));
        });
        QVERIFY2(missed.isEmpty(), qPrintable(missed.join(QLatin1Char(10))));
        Screen::views()->closePopup(view);
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<FocusControlTest>(argc, argv);
}

#include "tst_focuscontrol.moc"
