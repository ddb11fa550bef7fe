// SPDX-License-Identifier: MIT
#include "pointcloud.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace Latin {

namespace {

// By trial on one of the recorded hands.
constexpr double weightOfDirection = 0.3;
constexpr double leastLength = 0.1; // of a stroke against the size of all, so that a dot has its share of points
constexpr double spot = 0.05;       // strokes up to this length against the size have no direction
constexpr double span = 0.6;        // of a step, to either side: where the direction is taken from

QRectF boundsOf(const QList<Stroke>& strokes)
{
    QPointF low(std::numeric_limits<double>::max(), std::numeric_limits<double>::max());
    QPointF high = -low;
    for (const Stroke& stroke : strokes) {
        for (const QPointF& point : stroke) {
            low = {std::min(low.x(), point.x()), std::min(low.y(), point.y())};
            high = {std::max(high.x(), point.x()), std::max(high.y(), point.y())};
        }
    }
    return QRectF(low, high);
}

double length(const QPointF& vector)
{
    return std::hypot(vector.x(), vector.y());
}

double lengthOf(const Stroke& stroke)
{
    double sum = 0;
    for (int i = 1; i < stroke.size(); ++i)
        sum += length(stroke.at(i) - stroke.at(i - 1));
    return sum;
}

QPointF pointAt(const Stroke& stroke, double distance)
{
    for (int i = 1; i < stroke.size(); ++i) {
        const QPointF step = stroke.at(i) - stroke.at(i - 1);
        const double size = length(step);
        if (size > 0 && distance <= size)
            return stroke.at(i - 1) + step * (distance / size);
        distance -= size;
    }
    return stroke.constLast();
}

QPointF doubledDirection(const QPointF& vector)
{
    const double x = vector.x();
    const double y = vector.y();
    const double square = x * x + y * y;
    return square > 0 ? QPointF((x * x - y * y) / square, 2 * x * y / square) : QPointF();
}

} // namespace

PointCloud::PointCloud(const QList<Stroke>& strokes)
    : m_bounds(boundsOf(strokes))
    , m_strokeCount(int(strokes.size()))
{
    const double size = std::max(m_bounds.width(), m_bounds.height());
    sample(strokes, size > 0 ? size : 1);
    center();
}

/// The longer a stroke, the more of the points are on it.
void PointCloud::sample(const QList<Stroke>& strokes, double size)
{
    const double extra = leastLength * size;
    double total = 0;
    for (const Stroke& stroke : strokes)
        total += lengthOf(stroke) + extra;
    const double step = total / count;

    double start = 0;
    int next = 0;
    for (int index = 0; index < strokes.size(); ++index) {
        const Stroke& stroke = strokes.at(index);
        const double drawn = lengthOf(stroke);
        const double end = index + 1 < strokes.size() ? start + drawn + extra : std::numeric_limits<double>::max();
        for (; next < count && (next + 0.5) * step <= end; ++next) {
            const double at = ((next + 0.5) * step - start) * drawn / (drawn + extra);
            const QPointF point = pointAt(stroke, at) / size;
            const QPointF line =
                pointAt(stroke, std::min(drawn, at + span * step)) - pointAt(stroke, std::max(0.0, at - span * step));
            const QPointF direction = drawn > spot * size ? doubledDirection(line) * weightOfDirection : QPointF();
            m_samples.at(size_t(next)) = {float(point.x()), float(point.y()), float(direction.x()),
                                          float(direction.y())};
        }
        start = end;
    }
}

void PointCloud::center()
{
    float x = 0;
    float y = 0;
    for (const Sample& sample : m_samples) {
        x += sample.x / count;
        y += sample.y / count;
    }
    for (Sample& sample : m_samples) {
        sample.x -= x;
        sample.y -= y;
    }
}

float PointCloud::squared(const Sample& a, const Sample& b)
{
    const float x = a.x - b.x;
    const float y = a.y - b.y;
    const float directionX = a.directionX - b.directionX;
    const float directionY = a.directionY - b.directionY;
    return x * x + y * y + directionX * directionX + directionY * directionY;
}

/// Of the two ways the worse: what is only a part of the other looks like it in one of them.
double PointCloud::distance(const PointCloud& other, double limit) const
{
    const double there = distanceTo(other, limit);
    return there < limit ? std::max(there, other.distanceTo(*this, limit)) : limit;
}

double PointCloud::distanceTo(const PointCloud& other, double limit) const
{
    double sum = 0;
    for (const Sample& sample : m_samples) {
        float nearest = std::numeric_limits<float>::max();
        for (const Sample& candidate : other.m_samples)
            nearest = std::min(nearest, squared(sample, candidate));
        sum += double(std::sqrt(nearest));
        if (sum >= limit * count)
            return limit;
    }
    return sum / count;
}

} // namespace Latin
