// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QQuickPaintedItem>
#include <QVariantList>
#include <QVector>

/// \brief What a finger draws, as QML tells it: smooth lines, of which each movement paints only the piece that is new.
class Ink : public QQuickPaintedItem
{
    Q_OBJECT
    Q_PROPERTY(QColor color READ color WRITE setColor NOTIFY colorChanged)
    Q_PROPERTY(qreal thickness READ thickness WRITE setThickness NOTIFY thicknessChanged)

public:
    explicit Ink(QQuickItem* parent = nullptr);

    QColor color() const { return m_color; }
    qreal thickness() const { return m_thickness; } ///< pixels
    void setColor(const QColor& color);
    void setThickness(qreal thickness);

    void paint(QPainter* painter) override;

    Q_INVOKABLE void begin(qreal x, qreal y); ///< a stroke begins
    Q_INVOKABLE void extend(qreal x, qreal y);
    Q_INVOKABLE QVariantList end(); ///< the points, QPointF, of the stroke that ends; empty when none was begun
    Q_INVOKABLE void clear();

Q_SIGNALS:
    void colorChanged();
    void thicknessChanged();

private:
    void paintStroke(QPainter* painter, const QVector<QPointF>& stroke) const;

    QColor m_color = Qt::black;
    qreal m_thickness = 4;
    QVector<QVector<QPointF>> m_strokes;
    bool m_drawing = false;
};
