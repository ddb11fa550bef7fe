// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <HmiGuiFramework/UiThemeManager>
#include <HmiStateMachine/StateMachine>

#include <memory>

using AL2HMIBridge::BridgeTester;

/// Every view and popup, in both sizes, both directions and both palettes: nothing is cut off, nothing is too small to touch.
class ScreensTest : public QObject
{
    Q_OBJECT

    static constexpr double smallestTarget = 51; // reference pixels: 9 mm on the reference screen

    static void fillWithState()
    {
        const auto record = [](std::initializer_list<std::pair<QString, QVariant>> fields) {
            return QVariant(QVariantMap(fields));
        };
        QVariantList stations;
        QVariantList presets;
        QVariantList contacts;
        for (int i = 1; i <= 12; ++i) {
            const QString name = QStringLiteral("Station %1").arg(i);
            const QString frequency = QString::number(88 + i) + QStringLiteral(".3");
            stations.append(record({{QStringLiteral("name"), name}, {QStringLiteral("frequency"), frequency}}));
            contacts.append(record({{QStringLiteral("name"), QStringLiteral("Person %1").arg(i)},
                                    {QStringLiteral("number"), QStringLiteral("+49 30 555%1").arg(i)}}));
            if (i <= 6)
                presets.append(record({{QStringLiteral("bank"), 1},
                                       {QStringLiteral("index"), i},
                                       {QStringLiteral("name"), name},
                                       {QStringLiteral("frequency"), frequency}}));
        }
        QVERIFY(BridgeTester::setState(
            "GlobalSource", {{"mainAudioSource", 1}, {"clockText", QStringLiteral("14:05")}, {"volume", 20}}));
        QVERIFY(BridgeTester::setState("FMTunerSource", {{"frequency", QStringLiteral("107.9")},
                                                         {"frequencyUnit", QStringLiteral("MHz")},
                                                         {"stationName", QStringLiteral("Station 12")},
                                                         {"stationList", stations},
                                                         {"presets", presets},
                                                         {"activePreset", 2},
                                                         {"activePresetBank", 1},
                                                         {"trafficAnnouncementEnabled", true}}));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"deviceName", QStringLiteral("A phone")},
                                                       {"signalStrength", 3},
                                                       {"batteryLevel", 100},
                                                       {"callerName", QStringLiteral("Person 1")},
                                                       {"callerNumber", QStringLiteral("+49 30 5551")},
                                                       {"contacts", contacts}}));
    }

    static QStringList cutOffTexts()
    {
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->property("truncated").toBool())
                found.append(Screen::pathOf(item) + QStringLiteral(": ") + item->property("text").toString());
        });
        return found;
    }

    static QStringList smallTargets()
    {
        const double scale = qMin(Screen::window()->width() / 1280.0, Screen::window()->height() / 720.0);
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->objectName() == QLatin1String("touchArea")
                && qMin(item->width(), item->height()) < smallestTarget * scale - 1)
                found.append(
                    QStringLiteral("%1: %2 x %3").arg(Screen::pathOf(item)).arg(item->width()).arg(item->height()));
        });
        return found;
    }

    /// Touchable items that lie partly outside of the window, unless they are in something that scrolls.
    static QStringList outside()
    {
        const QRectF window(QPointF(0, 0), QSizeF(Screen::window()->size()));
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->objectName() != QLatin1String("touchArea"))
                return;
            for (const QQuickItem* parent = item; parent; parent = parent->parentItem())
                if (parent->inherits("QQuickFlickable"))
                    return;
            if (!window.contains(item->mapRectToScene(QRectF(0, 0, item->width(), item->height()))))
                found.append(Screen::pathOf(item));
        });
        return found;
    }

    static bool show(const QString& name)
    {
        auto* const views = Screen::views();
        if (views->guiDescriptor().popups.contains(name))
            return views->requestPopup(name);
        return views->requestView(name) && Screen::shows(qPrintable(name));
    }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        fillWithState();
    }

    void cleanup()
    {
        HmiGuiFramework::AppSettings::instance()->setRightToLeft(false);
        Screen::views()->requestView(QStringLiteral("SYSTEM.Launcher"));
        m_vehicle.reset();
        m_log.reset();
    }

    void everythingFits_data()
    {
        QTest::addColumn<QString>("view");
        QTest::addColumn<QSize>("size");
        QTest::addColumn<bool>("rightToLeft");
        QTRY_VERIFY(!Screen::views()->guiDescriptor().views.isEmpty());
        const auto descriptor = Screen::views()->guiDescriptor();
        QStringList names = descriptor.views.keys() + descriptor.popups.keys();
        names.sort();
        QVERIFY(names.size() >= 12);
        for (const QString& name : std::as_const(names))
            for (const QSize& size : {QSize(1280, 720), QSize(800, 480)})
                for (const bool rightToLeft : {false, true})
                    QTest::addRow("%s %dx%d %s", qPrintable(name), size.width(), size.height(),
                                  rightToLeft ? "rtl" : "ltr")
                        << name << size << rightToLeft;
    }

    void everythingFits()
    {
        QFETCH(QString, view);
        QFETCH(QSize, size);
        QFETCH(bool, rightToLeft);
        Screen::window()->resize(size);
        HmiGuiFramework::AppSettings::instance()->setRightToLeft(rightToLeft);
        QVERIFY(show(view));
        QTRY_COMPARE(Screen::views()->stage()->size(), QSizeF(size));
        QCOMPARE(cutOffTexts(), QStringList());
        QCOMPARE(smallTargets(), QStringList());
        QCOMPARE(outside(), QStringList());
        Screen::views()->closePopup(view);
    }

    void everyTextIsPlain()
    {
        for (const auto& view : Screen::views()->guiDescriptor().views) {
            QVERIFY(show(view.identifier));
            Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
                if (item->inherits("QQuickText"))
                    QVERIFY2(item->property("textFormat").toInt() == Qt::PlainText, qPrintable(Screen::pathOf(item)));
            });
        }
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<ScreensTest>(argc, argv);
}

#include "tst_screens.moc"
