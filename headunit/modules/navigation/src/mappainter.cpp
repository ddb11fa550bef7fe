// SPDX-License-Identifier: MIT
#include "mappainter.h"

#include "placecategories.h"

#include <QBuffer>
#include <QFile>
#include <QFontMetricsF>
#include <QImageReader>
#include <QLineF>
#include <QPainter>
#include <QPainterPath>

#include <algorithm>
#include <cmath>

namespace {

constexpr double leastZoomOfPlaces = 0.12; ///< pixels per metre, at one pixel a reference pixel
constexpr double leastZoomOfNames = 0.14;
constexpr double leastZoomOfMinorNames = 0.34;

struct RoadLook
{
    StreetClass kind;
    const char* color;
    double metres; ///< wide
    double least;  ///< reference pixels
};

/// From below to above.
constexpr RoadLook roads[] = {{StreetClass::Minor, "street", 13, 2},
                              {StreetClass::Main, "mainStreet", 21, 5},
                              {StreetClass::Motorway, "motorway", 28, 7}};

/// One picture being drawn, in pixels.
class MapPainter
{
public:
    MapPainter(const MapPicture& picture, QImage* image)
        : m_picture(picture)
        , m_painter(image)
        , m_zoom(picture.zoom / picture.unit)
        , m_frame(QPointF(0, 0), QSizeF(picture.size))
    {
        m_painter.setRenderHint(QPainter::Antialiasing);
        m_painter.setFont(picture.font);
    }

    void draw()
    {
        drawAreas();
        for (const RoadLook& road : roads)
            drawRoads(road, color("roadEdge"), 2 * m_picture.unit);
        for (const RoadLook& road : roads)
            drawRoads(road, color(road.color), 0);
        drawRoute();
        if (m_zoom >= leastZoomOfPlaces)
            drawPlaces();
        if (m_zoom >= leastZoomOfNames)
            drawNames();
    }

private:
    QColor color(const char* name) const { return m_picture.colors.value(QLatin1String(name)); }

    QPointF toPixels(const QPointF& metres) const
    {
        return (metres - m_picture.centre) * m_picture.zoom + m_frame.center();
    }

    QPolygonF toPixels(const QPolygonF& metres) const
    {
        QPolygonF pixels;
        pixels.reserve(metres.size());
        for (const QPointF& point : metres)
            pixels.append(toPixels(point));
        return pixels;
    }

    double widthOf(const RoadLook& road) const
    {
        return std::max(road.least * m_picture.unit, road.metres * m_picture.zoom);
    }

    void drawAreas()
    {
        static constexpr const char* fills[] = {"built", "park", "water"}; // as AreaKind counts
        m_painter.setPen(Qt::NoPen);
        for (const Area& area : m_picture.town->areas) {
            m_painter.setBrush(color(fills[int(area.kind)]));
            m_painter.drawPolygon(toPixels(area.outline));
        }
    }

    void drawRoads(const RoadLook& road, const QColor& fill, double extra)
    {
        m_painter.setPen(QPen(fill, widthOf(road) + extra, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        for (const Street& street : m_picture.town->streets) {
            const QPolygonF line = toPixels(street.points);
            if (street.kind == road.kind && line.boundingRect().adjusted(-40, -40, 40, 40).intersects(m_frame))
                m_painter.drawPolyline(line);
        }
    }

    void drawRoute()
    {
        if (m_picture.route.isEmpty())
            return;
        const QPolygonF line = toPixels(m_picture.route);
        const double width = std::max(9 * m_picture.unit, 17 * m_picture.zoom);
        m_painter.setPen(
            QPen(color("routeEdge"), width + 4 * m_picture.unit, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        m_painter.drawPolyline(line);
        m_painter.setPen(QPen(color("route"), width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        m_painter.drawPolyline(line);
        drawMark(line.constLast(), QStringLiteral("destination"), 46, color("route"));
    }

    void drawPlaces()
    {
        for (const Place& place : m_picture.town->places) {
            const QPointF at = toPixels(place.at);
            if (m_frame.contains(at) && isFree(markRect(at, 30)))
                drawMark(at, QString::fromLatin1(PlaceCategories::find(place.category).icon), 30, color("mark"));
        }
    }

    QRectF markRect(const QPointF& at, double size) const
    {
        const double side = size * m_picture.unit;
        return {at.x() - side / 2, at.y() - side / 2, side, side};
    }

    void drawMark(const QPointF& at, const QString& icon, double size, const QColor& fill)
    {
        const QRectF circle = markRect(at, size);
        m_painter.setPen(QPen(color("markEdge"), 2 * m_picture.unit));
        m_painter.setBrush(fill);
        m_painter.drawEllipse(circle);
        m_painter.setBrush(Qt::NoBrush);
        const QRectF inner = markRect(at, size * 0.66);
        m_painter.drawImage(inner.topLeft(), iconOf(icon, inner.size().toSize()));
        m_taken.append(circle);
    }

    /// Icons are drawn in `currentColor`, see docs/themes.md.
    QImage iconOf(const QString& name, const QSize& size)
    {
        const QString key = name + QString::number(size.width());
        if (!m_icons.contains(key)) {
            QFile file(QStringLiteral(":/icons/%1.svg").arg(name));
            QByteArray svg = file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
            svg.replace("currentColor", color("markEdge").name().toLatin1());
            QBuffer buffer(&svg);
            QImageReader reader(&buffer, "svg");
            reader.setScaledSize(size);
            m_icons.insert(key, reader.read());
        }
        return m_icons.value(key);
    }

    bool isFree(const QRectF& rect) const
    {
        return std::none_of(m_taken.cbegin(), m_taken.cend(),
                            [&](const QRectF& other) { return other.intersects(rect); });
    }

    void drawNames()
    {
        for (const Area& area : m_picture.town->areas)
            if (!area.name.isEmpty() && area.kind == AreaKind::Park)
                drawName(area.name, toPixels(area.outline.boundingRect().center()), 0, color("parkName"));
        for (const StreetClass kind : {StreetClass::Motorway, StreetClass::Main, StreetClass::Minor})
            if (kind != StreetClass::Minor || m_zoom >= leastZoomOfMinorNames)
                for (const Street& street : m_picture.town->streets)
                    if (street.kind == kind)
                        drawNameOf(street);
    }

    /// Along its straightest and longest part that is in the picture, and where no other name is.
    void drawNameOf(const Street& street)
    {
        const double needed = QFontMetricsF(m_picture.font).horizontalAdvance(street.name);
        const QPolygonF line = toPixels(street.points);
        for (int first = 0; first + 1 < line.size(); ++first) {
            int last = first + 1;
            const double angle = QLineF(line.at(first), line.at(last)).angle();
            while (last + 1 < line.size() && isAlike(angle, QLineF(line.at(last), line.at(last + 1)).angle()))
                ++last;
            const QLineF part(line.at(first), line.at(last));
            if (part.length() > needed * 1.15 && drawName(street.name, part.center(), part.angle(), color("name")))
                return;
            first = last - 1;
        }
    }

    static bool isAlike(double one, double other) { return std::abs(std::remainder(one - other, 360)) < 9; }

    bool drawName(const QString& text, const QPointF& at, double angle, const QColor& ink)
    {
        const QFontMetricsF metrics(m_picture.font);
        const double width = metrics.horizontalAdvance(text);
        const double turn = std::remainder(angle, 180); // never upside down
        QTransform place = QTransform::fromTranslate(at.x(), at.y());
        place.rotate(-turn);
        const QRectF box(-width / 2, -metrics.height() / 2, width, metrics.height());
        const QRectF taken = place.mapRect(box);
        if (!m_frame.contains(taken) || !isFree(taken))
            return false;
        m_taken.append(taken);
        QPainterPath path;
        path.addText(-width / 2, metrics.ascent() - metrics.height() / 2, m_picture.font, text);
        m_painter.save();
        m_painter.setTransform(place);
        m_painter.strokePath(path,
                             QPen(color("nameEdge"), 4 * m_picture.unit, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        m_painter.fillPath(path, ink);
        m_painter.restore();
        return true;
    }

    const MapPicture& m_picture;
    QPainter m_painter;
    const double m_zoom; ///< reference pixels per metre
    const QRectF m_frame;
    QVector<QRectF> m_taken; ///< by marks and names
    QHash<QString, QImage> m_icons;
};

} // namespace

QRectF MapPicture::area() const
{
    const QSizeF metres = QSizeF(size) / zoom;
    return {centre - QPointF(metres.width() / 2, metres.height() / 2), metres};
}

QImage MapPicture::draw() const
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(colors.value(QStringLiteral("land")));
    MapPainter(*this, &image).draw();
    return image;
}
