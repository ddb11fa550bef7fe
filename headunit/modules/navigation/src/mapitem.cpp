// SPDX-License-Identifier: MIT
#include "mapitem.h"

#include <QQuickWindow>
#include <QSGImageNode>

#include <algorithm>
#include <utility>

namespace {

constexpr double smallestZoom = 0.07; ///< pixels per metre, at one pixel a reference pixel
constexpr double largestZoom = 1.6;
constexpr double overlap = 0.5; ///< how much larger than the item a picture is
constexpr double margin = 0.05; ///< how near its edge may come before the next one is drawn

} // namespace

MapItem::MapItem(QQuickItem* parent)
    : QQuickItem(parent)
{
    setFlag(ItemHasContents);
    setClip(true);
    m_drawer.moveToThread(&m_thread);
}

/// What is being drawn would be handed to an item that is gone.
MapItem::~MapItem()
{
    m_thread.quit();
    m_thread.wait();
}

void MapItem::setNavigator(Navigator* navigator)
{
    if (navigator == m_navigator)
        return;
    if (m_navigator)
        m_navigator->disconnect(this);
    m_navigator = navigator;
    if (navigator) {
        m_centre = navigator->position();
        connect(navigator, &Navigator::moved, this, &MapItem::follow);
        connect(navigator, &Navigator::routeChanged, this, &MapItem::redraw);
    }
    Q_EMIT navigatorChanged();
    redraw();
}

void MapItem::setColors(const QVariantMap& colors)
{
    if (colors == m_colors)
        return;
    m_colors = colors;
    Q_EMIT colorsChanged();
    redraw();
}

void MapItem::setFont(const QFont& font)
{
    if (font == m_font)
        return;
    m_font = font;
    Q_EMIT fontChanged();
    redraw();
}

void MapItem::setUnit(qreal unit)
{
    if (unit == m_unit || unit <= 0)
        return;
    m_zoom *= unit / m_unit;
    m_unit = unit;
    Q_EMIT unitChanged();
    redraw();
}

void MapItem::setPivot(const QPointF& point)
{
    if (point == m_pivot)
        return;
    m_pivot = point;
    Q_EMIT pivotChanged();
    changeView();
}

void MapItem::setFollowing(bool following)
{
    if (following == m_following)
        return;
    m_following = following;
    Q_EMIT followingChanged();
    follow();
}

QPointF MapItem::vehicle() const
{
    return m_navigator ? (m_navigator->position() - m_centre) * m_zoom + m_pivot : m_pivot;
}

void MapItem::panBy(qreal x, qreal y)
{
    if (!m_navigator)
        return;
    setFollowing(false);
    const QRectF bounds = m_navigator->town()->bounds;
    const QPointF centre = m_centre - QPointF(x, y) / m_zoom;
    m_centre = {std::clamp(centre.x(), bounds.left(), bounds.right()),
                std::clamp(centre.y(), bounds.top(), bounds.bottom())};
    changeView();
}

void MapItem::zoomBy(qreal factor)
{
    m_zoom = std::clamp(m_zoom * factor, smallestZoom * m_unit, largestZoom * m_unit);
    changeView();
}

void MapItem::follow()
{
    if (m_following && m_navigator)
        m_centre = m_navigator->position();
    changeView();
}

void MapItem::redraw()
{
    m_isStale = true;
    changeView();
}

void MapItem::changeView()
{
    Q_EMIT viewChanged();
    polish();
    update();
}

#if QT_VERSION < QT_VERSION_CHECK(6, 0, 0)
void MapItem::geometryChanged(const QRectF& now, const QRectF& before)
{
    QQuickItem::geometryChanged(now, before);
    changeView();
}
#else
void MapItem::geometryChange(const QRectF& now, const QRectF& before)
{
    QQuickItem::geometryChange(now, before);
    changeView();
}
#endif

QRectF MapItem::visibleArea() const
{
    return {m_centre - m_pivot / m_zoom, size() / m_zoom};
}

/// Whether the picture that is there, or will be soon, goes on showing what is to be seen.
bool MapItem::isEnough() const
{
    const QRectF visible = visibleArea();
    const double room = visible.width() * margin;
    return !m_isStale && qFuzzyCompare(m_picture.zoom, m_zoom)
           && m_picture.area().contains(visible.adjusted(-room, -room, room, room));
}

MapPicture MapItem::wanted() const
{
    MapPicture picture;
    picture.town = m_navigator->town();
    picture.centre = visibleArea().center();
    picture.zoom = m_zoom;
    picture.size = (size() * (1 + overlap)).toSize();
    picture.route = m_navigator->route().points;
    for (auto color = m_colors.constBegin(); color != m_colors.constEnd(); ++color)
        picture.colors.insert(color.key(), color.value().value<QColor>());
    picture.font = m_font;
    picture.unit = m_unit;
    return picture;
}

void MapItem::updatePolish()
{
    if (!m_navigator || m_isDrawing || width() < 1 || height() < 1 || isEnough())
        return;
    m_isStale = false;
    m_picture = wanted();
    if (m_immediate) {
        show(m_picture, m_picture.draw());
        return;
    }
    m_isDrawing = true;
    if (!m_thread.isRunning())
        m_thread.start();
    const auto take = [this](const MapPicture& picture, const QImage& image) {
        m_isDrawing = false;
        show(picture, image);
        polish(); // the view may have moved on
    };
    const auto draw = [this, take, picture = m_picture] {
        const QImage image = picture.draw();
        QMetaObject::invokeMethod(
            this, [take, picture, image] { take(picture, image); }, Qt::QueuedConnection);
    };
    QMetaObject::invokeMethod(&m_drawer, draw, Qt::QueuedConnection);
}

void MapItem::show(const MapPicture& picture, const QImage& image)
{
    m_image = image;
    m_imageArea = picture.area();
    m_imageIsNew = true;
    update();
    Q_EMIT drawn();
}

QSGNode* MapItem::updatePaintNode(QSGNode* node, UpdatePaintNodeData*)
{
    auto* image = static_cast<QSGImageNode*>(node);
    if (m_image.isNull()) {
        delete image;
        return nullptr;
    }
    if (!image) {
        image = window()->createImageNode();
        image->setOwnsTexture(true);
        image->setFiltering(QSGTexture::Linear);
        m_imageIsNew = true;
    }
    if (std::exchange(m_imageIsNew, false))
        image->setTexture(window()->createTextureFromImage(m_image, QQuickWindow::TextureIsOpaque));
    const QPointF corner = (m_imageArea.topLeft() - m_centre) * m_zoom + m_pivot;
    // Whole pixels, so that what is not zoomed stays sharp.
    image->setRect(QRectF(corner.toPoint(), (m_imageArea.size() * m_zoom).toSize()));
    return image;
}
