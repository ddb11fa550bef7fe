// SPDX-License-Identifier: MIT
#pragma once

#include <QPolygonF>
#include <QString>
#include <QVector>

enum class Manoeuvre {
    Depart,
    Straight,
    SlightLeft,
    SlightRight,
    Left,
    Right,
    SharpLeft,
    SharpRight,
    TurnRound,
    Arrive,
};

struct RouteStep
{
    Manoeuvre manoeuvre;
    QString street; ///< that is driven on from there; may be empty
    double at;      ///< metres from the start of the route
};

/// \brief A way through the town. Empty when there is none.
struct Route
{
    struct Leg ///< from one point to the next
    {
        QString street;
        double speed; ///< metres per second
    };

    QPolygonF points;
    QVector<double> marks; ///< metres from the start, of each point
    QVector<Leg> legs;     ///< one less than points
    QVector<RouteStep> steps;

    bool isEmpty() const { return points.size() < 2; }
    double length() const { return marks.isEmpty() ? 0 : marks.constLast(); }

    /// \brief The leg that lies \a metres from the start; the last one from the end on.
    int legAt(double metres) const;
    /// \brief The point there.
    QPointF pointAt(double metres) const;
    /// \brief Degrees clockwise from the north there.
    double headingAt(double metres) const;
    /// \brief Seconds from there to the end.
    double secondsFrom(double metres) const;

    /// \brief Fills marks and steps from points and legs; \a isJunction tells where one can leave the way.
    void complete(const QVector<bool>& isJunction);
};

/// \brief Degrees clockwise from the north of the line from \a from to \a to.
double headingOf(const QPointF& from, const QPointF& to);

/// \brief What a turn by \a degrees, positive to the right and from -180 to 180, is called.
Manoeuvre turnOf(double degrees);
