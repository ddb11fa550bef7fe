// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QPointF>
#include <QRectF>

#include <array>

namespace Latin {

using Stroke = QList<QPointF>;

/// \brief What strokes look like, whatever their size, place, order and direction: points at even steps along them.
///
/// The $P family of recognizers compares such clouds. This one lets each point take the nearest of the other cloud, also one
/// that is taken, and compares the direction of the line there as well.
class PointCloud
{
public:
    /// \brief Of all strokes together; each has a point, and coordinates are finite, with y downwards.
    explicit PointCloud(const QList<Stroke>& strokes);

    /// \brief How far the two are from looking alike: 0 is the same, 1 would be points as far apart as the larger of width and
    /// height. From \a limit on it is not told how much more.
    double distance(const PointCloud& other, double limit) const;

    int strokeCount() const { return m_strokeCount; }
    QRectF bounds() const { return m_bounds; } ///< of the strokes as they were given

private:
    static constexpr int count = 32;

    /// The direction has twice the angle of the line, so that it is the same forwards and backwards; none in a spot.
    struct Sample
    {
        float x = 0, y = 0, directionX = 0, directionY = 0;
    };

    double distanceTo(const PointCloud& other, double limit) const;
    void sample(const QList<Stroke>& strokes, double size);
    void center();

    static float squared(const Sample& a, const Sample& b);

    std::array<Sample, count> m_samples;
    QRectF m_bounds;
    int m_strokeCount;
};

} // namespace Latin
