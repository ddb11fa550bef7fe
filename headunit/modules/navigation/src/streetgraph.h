// SPDX-License-Identifier: MIT
#pragma once

#include "route.h"
#include "town.h"

#include <QHash>
#include <QPair>
#include <QVector>

/// \brief The streets of a town as vertices and edges, in which the fastest way is found. Any thread may read it.
class StreetGraph
{
public:
    explicit StreetGraph(const Town& town);

    /// \brief The fastest way from the street nearest to \a from to the one nearest to \a to, in either direction of any street.
    ///
    /// Motorways are left out with \a avoidMotorways unless one ends or starts there. Empty when no street joins the two.
    Route route(const QPointF& from, const QPointF& to, bool avoidMotorways) const;

    /// \brief The point of a street that is nearest to \a point.
    QPointF onStreet(const QPointF& point) const { return nearest(point).point; }

private:
    struct Edge
    {
        int from;
        int to;
        double length; ///< metres
        QString street;
        StreetClass kind;
    };

    struct Spot ///< a point on an edge
    {
        int edge;
        double along; ///< metres from its start
        QPointF point;
    };

    struct Arrival ///< how a vertex is reached
    {
        double seconds;
        int edge;
    };

    int vertexAt(const QPointF& point);
    Spot nearest(const QPointF& point) const;
    QVector<Arrival> search(const Spot& start, bool avoidMotorways) const;
    Route trace(const Spot& start, const Spot& goal, const QVector<Arrival>& arrivals, int last) const;
    Route between(const Spot& start, const Spot& goal) const;
    int otherEnd(const Edge& edge, int vertex) const { return edge.from == vertex ? edge.to : edge.from; }

    QVector<QPointF> m_vertices;
    QVector<Edge> m_edges;
    QVector<QVector<int>> m_edgesAt; ///< of each vertex
    QHash<QPair<qint64, qint64>, int> m_vertexAt;
};
