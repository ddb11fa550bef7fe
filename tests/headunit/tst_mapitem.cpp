// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "mapitem.h"

#include <AL2HMIBridge/BridgeTester>

#include <QGuiApplication>
#include <QQuickWindow>
#include <QScreen>
#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

/// The map in a window: what it shows where, and when it draws anew.
class MapItemTest : public QObject
{
    Q_OBJECT

    static QVariantMap colors()
    {
        QVariantMap map;
        for (const char* const name : {"land", "built", "park", "water", "street", "mainStreet", "motorway", "roadEdge",
                                       "route", "routeEdge", "name", "nameEdge", "parkName", "mark", "markEdge"})
            map.insert(QString::fromLatin1(name), QColor(Qt::gray));
        map.insert(QStringLiteral("land"), QColor(Qt::white));
        map.insert(QStringLiteral("water"), QColor(Qt::blue));
        map.insert(QStringLiteral("route"), QColor(Qt::red));
        return map;
    }

    /// Water to the east of a street that leads from the north to the south through (0, 0).
    static std::shared_ptr<const Town> shore()
    {
        auto town = std::make_shared<Town>();
        town->streets.append(
            {QStringLiteral("Shore"), StreetClass::Minor, QVector<QPointF>{QPointF(0, -2000), QPointF(0, 2000)}});
        town->areas.append(
            {AreaKind::Water, QString(),
             QVector<QPointF>{QPointF(100, -9000), QPointF(9000, -9000), QPointF(9000, 9000), QPointF(100, 9000)}});
        town->places = {{QStringLiteral("Pier"), QStringLiteral("sight"), {0, 1000}}};
        town->bounds = {-2000, -2000, 4000, 4000};
        return town;
    }

    bool isShown(int pictures)
    {
        return QTest::qWaitFor([&] { return m_drawn->size() >= pictures; });
    }

    QColor pixel(int x, int y) const
    {
        const QImage image = QGuiApplication::primaryScreen()->grabWindow(m_window->winId()).toImage();
        return image.isNull() ? QColor() : image.pixelColor(x, y);
    }

    std::optional<LogCapture> m_log;
    std::unique_ptr<AL2HMIBridge::BridgeTester> m_vehicle;
    std::unique_ptr<Navigator> m_navigator;
    std::unique_ptr<QQuickWindow> m_window;
    MapItem* m_map = nullptr;
    std::unique_ptr<QSignalSpy> m_drawn;

private Q_SLOTS:
    void init()
    {
        m_log.emplace();
        m_vehicle = std::make_unique<AL2HMIBridge::BridgeTester>();
        m_navigator = std::make_unique<Navigator>(shore(), nullptr);
        m_window = std::make_unique<QQuickWindow>();
        m_window->resize(400, 300);
        m_map = new MapItem(m_window->contentItem());
        m_drawn = std::make_unique<QSignalSpy>(m_map, &MapItem::drawn);
        m_map->setColors(colors());
        m_map->setPivot({200, 150});
        m_map->setSize({400, 300});
        m_map->setNavigator(m_navigator.get());
        m_window->show();
        QVERIFY(isShown(1));
    }

    void cleanup()
    {
        m_drawn.reset();
        m_window.reset();
        m_navigator.reset();
        m_vehicle.reset();
        m_log.reset();
    }

    void theVehicleIsWhereThePivotIs()
    {
        QCOMPARE(m_map->vehicle(), QPointF(200, 150));
        m_map->setPivot({300, 150});
        QCOMPARE(m_map->vehicle(), QPointF(300, 150));
    }

    void whatLiesInTheEastIsAtTheRight()
    {
        QTRY_COMPARE(pixel(390, 30), QColor(Qt::blue));
        QCOMPARE(pixel(20, 30), QColor(Qt::white));
    }

    void itMovesWithAFingerAndComesBack()
    {
        m_map->panBy(-50, 20);
        QVERIFY(!m_map->isFollowing());
        QCOMPARE(m_map->vehicle(), QPointF(150, 170));
        QTRY_COMPARE(pixel(20, 30), QColor(Qt::white));
        m_map->panBy(100000, 0);
        QCOMPARE(m_map->centre().x(), -2000.0); // not beyond the town
        m_map->setFollowing(true);
        QCOMPARE(m_map->vehicle(), QPointF(200, 150));
    }

    void zoomHasLimits()
    {
        m_map->zoomBy(2);
        QCOMPARE(m_map->zoom(), 0.8);
        m_map->zoomBy(1000);
        QCOMPARE(m_map->zoom(), 1.6);
        m_map->zoomBy(0.00001);
        QCOMPARE(m_map->zoom(), 0.07);
    }

    void smallMovesNeedNoNewPicture()
    {
        for (int i = 0; i < 10; ++i)
            m_map->panBy(1, 1);
        QSignalSpy frames(m_window.get(), &QQuickWindow::frameSwapped);
        QVERIFY(frames.wait());
        QCOMPARE(m_drawn->size(), 1);
        m_map->panBy(300, 0);
        QVERIFY(isShown(2));
    }

    void theRouteIsDrawn()
    {
        QVERIFY(pixel(200, 250) != QColor(Qt::red));
        QVERIFY(m_navigator->navigateTo(0));
        QVERIFY(isShown(2));
        QTRY_COMPARE(pixel(200, 250), QColor(Qt::red));
        m_navigator->stop();
        QVERIFY(isShown(3));
        QTRY_VERIFY(pixel(200, 250) != QColor(Qt::red));
    }

    void theMapFollowsTheVehicle()
    {
        QVERIFY(m_navigator->navigateTo(0));
        m_navigator->advance(10);
        QCOMPARE(m_map->centre(), QPointF(0, 240));
        QCOMPARE(m_map->vehicle(), QPointF(200, 150));
    }

    void newColorsAreDrawnAtOnce()
    {
        QVariantMap night = colors();
        night.insert(QStringLiteral("land"), QColor(Qt::black));
        m_map->setColors(night);
        QVERIFY(isShown(2));
        QTRY_COMPARE(pixel(20, 30), QColor(Qt::black));
    }

    void aMapThatGoesWhileItIsDrawnIsMissedByNobody()
    {
        m_map->zoomBy(1.2);
        QSignalSpy frames(m_window.get(), &QQuickWindow::frameSwapped);
        QVERIFY(frames.wait()); // its picture is being drawn
        m_drawn.reset();
        delete m_map;
        QCoreApplication::processEvents();
    }
};

QTEST_MAIN(MapItemTest)
#include "tst_mapitem.moc"
