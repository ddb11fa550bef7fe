// SPDX-License-Identifier: MIT
#include "route.h"

#include <QLineF>
#include <QtMath>

#include <algorithm>
#include <cmath>

namespace {

constexpr double bendWithoutWord = 35; ///< degrees that a street may bend at a junction and is still followed

struct Turn
{
    double least; ///< degrees
    Manoeuvre left;
    Manoeuvre right;
};

constexpr Turn turns[] = {{165, Manoeuvre::TurnRound, Manoeuvre::TurnRound},
                          {120, Manoeuvre::SharpLeft, Manoeuvre::SharpRight},
                          {55, Manoeuvre::Left, Manoeuvre::Right},
                          {20, Manoeuvre::SlightLeft, Manoeuvre::SlightRight}};

} // namespace

double headingOf(const QPointF& from, const QPointF& to)
{
    const double degrees = qRadiansToDegrees(std::atan2(to.x() - from.x(), from.y() - to.y()));
    return degrees < 0 ? degrees + 360 : degrees;
}

Manoeuvre turnOf(double degrees)
{
    for (const Turn& turn : turns)
        if (std::abs(degrees) >= turn.least)
            return degrees < 0 ? turn.left : turn.right;
    return Manoeuvre::Straight;
}

int Route::legAt(double metres) const
{
    const auto next = std::upper_bound(marks.cbegin(), marks.cend(), metres);
    return std::clamp(int(next - marks.cbegin()) - 1, 0, int(legs.size()) - 1);
}

QPointF Route::pointAt(double metres) const
{
    const int leg = legAt(metres);
    const double length = marks.at(leg + 1) - marks.at(leg);
    const double part = length > 0 ? std::clamp((metres - marks.at(leg)) / length, 0.0, 1.0) : 0;
    return points.at(leg) + (points.at(leg + 1) - points.at(leg)) * part;
}

double Route::headingAt(double metres) const
{
    const int leg = legAt(metres);
    return headingOf(points.at(leg), points.at(leg + 1));
}

double Route::secondsFrom(double metres) const
{
    double seconds = 0;
    for (int leg = legAt(metres); leg < legs.size(); ++leg)
        seconds += std::max(0.0, marks.at(leg + 1) - std::max(metres, marks.at(leg))) / legs.at(leg).speed;
    return seconds;
}

void Route::complete(const QVector<bool>& isJunction)
{
    marks = {0};
    for (int i = 1; i < points.size(); ++i)
        marks.append(marks.constLast() + QLineF(points.at(i - 1), points.at(i)).length());
    steps = {{Manoeuvre::Depart, legs.constFirst().street, 0}};
    for (int i = 1; i < legs.size(); ++i) {
        const double bend =
            std::remainder(headingOf(points.at(i), points.at(i + 1)) - headingOf(points.at(i - 1), points.at(i)), 360);
        const bool isOtherStreet = legs.at(i).street != legs.at(i - 1).street;
        if (isOtherStreet || (isJunction.at(i) && std::abs(bend) > bendWithoutWord))
            steps.append({turnOf(bend), legs.at(i).street, marks.at(i)});
    }
    steps.append({Manoeuvre::Arrive, QString(), length()});
}
