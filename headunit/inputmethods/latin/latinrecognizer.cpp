// SPDX-License-Identifier: MIT
#include "latinrecognizer.h"

#include "latinmatcher.h"

#include <algorithm>
#include <cmath>

namespace Latin {

namespace {

// Where on the writing area capitals are expected, in per cent of its height.
constexpr double top = 13;
constexpr double capital = 65;

/// Of a writing area that somebody can write on.
double aspectOf(double width, double height)
{
    const double aspect = width / height;
    return std::isfinite(aspect) ? std::clamp(aspect, 0.1, 10.0) : 1;
}

} // namespace

LatinRecognizer::LatinRecognizer(QObject* parent)
    : CharacterRecognizer(parent)
{
}

void LatinRecognizer::recognition(const QList<QList<QPoint>>& strokes)
{
    Matcher::prepare(); // also when there is nothing to recognise: that is what the factory asks for
    CharacterRecognizer::recognition(strokes);
}

/// Per cent of width and height are not the same length, unless the area is a square.
QStringList LatinRecognizer::candidatesFor(const QList<QList<QPoint>>& strokes, int count)
{
    const double aspect = aspectOf(inputWidth(), inputHeight());
    QList<Stroke> written;
    for (const QList<QPoint>& points : strokes) {
        Stroke stroke;
        for (const QPoint& point : points)
            stroke.append(QPointF(point.x() * aspect / capital, (point.y() - top) / capital));
        written.append(stroke);
    }
    return Matcher::candidates(written, count);
}

} // namespace Latin
