// SPDX-License-Identifier: MIT
#include "ink.h"

#include <QPainter>
#include <QPainterPath>

#include <algorithm>

namespace {

constexpr int mostPoints = 20000; // of a stroke; a finger that never lifts

QRectF around(const QPointF& a, const QPointF& b, qreal reach)
{
    return QRectF(a, b).normalized().adjusted(-reach, -reach, reach, reach);
}

} // namespace

Ink::Ink(QQuickItem* parent)
    : QQuickPaintedItem(parent)
{
    setAntialiasing(true);
}

void Ink::setColor(const QColor& color)
{
    if (color == m_color)
        return;
    m_color = color;
    update();
    Q_EMIT colorChanged();
}

void Ink::setThickness(qreal thickness)
{
    if (thickness == m_thickness)
        return;
    m_thickness = thickness;
    update();
    Q_EMIT thicknessChanged();
}

void Ink::paint(QPainter* painter)
{
    painter->setPen(QPen(m_color, m_thickness, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    for (const QVector<QPointF>& stroke : std::as_const(m_strokes))
        paintStroke(painter, stroke);
}

/// Only what lies where something is to be painted, which mostly is the end of the last stroke.
void Ink::paintStroke(QPainter* painter, const QVector<QPointF>& stroke) const
{
    const QRectF wanted = painter->hasClipping() ? painter->clipBoundingRect() : boundingRect();
    if (stroke.size() == 1)
        painter->drawPoint(stroke.constFirst());
    for (int i = 1; i < stroke.size(); ++i)
        if (around(stroke.at(i - 1), stroke.at(i), m_thickness).intersects(wanted))
            painter->drawLine(stroke.at(i - 1), stroke.at(i));
}

void Ink::begin(qreal x, qreal y)
{
    m_strokes.append({QPointF(x, y)});
    m_drawing = true;
    update(around({x, y}, {x, y}, m_thickness).toAlignedRect());
}

void Ink::extend(qreal x, qreal y)
{
    if (!m_drawing || m_strokes.constLast().size() >= mostPoints)
        return;
    const QPointF before = m_strokes.constLast().constLast();
    m_strokes.last().append(QPointF(x, y));
    update(around(before, {x, y}, m_thickness).toAlignedRect());
}

QVariantList Ink::end()
{
    QVariantList points;
    if (!m_drawing)
        return points;
    m_drawing = false;
    for (const QPointF& point : std::as_const(m_strokes.last()))
        points.append(point);
    return points;
}

void Ink::clear()
{
    m_strokes.clear();
    m_drawing = false;
    update();
}
