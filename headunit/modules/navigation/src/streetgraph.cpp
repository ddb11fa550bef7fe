// SPDX-License-Identifier: MIT
#include "streetgraph.h"

#include <QLineF>

#include <algorithm>
#include <functional>
#include <limits>
#include <queue>

namespace {

constexpr double never = std::numeric_limits<double>::infinity();

/// Metres per second that one drives at on average.
double speedOn(StreetClass kind)
{
    switch (kind) {
    case StreetClass::Motorway:
        return 28;
    case StreetClass::Main:
        return 14;
    case StreetClass::Minor:
        break;
    }
    return 8;
}

} // namespace

StreetGraph::StreetGraph(const Town& town)
{
    for (const Street& street : town.streets) {
        for (int i = 1; i < street.points.size(); ++i) {
            const int from = vertexAt(street.points.at(i - 1));
            const int to = vertexAt(street.points.at(i));
            m_edgesAt[from].append(int(m_edges.size()));
            m_edgesAt[to].append(int(m_edges.size()));
            m_edges.append(
                {from, to, QLineF(m_vertices.at(from), m_vertices.at(to)).length(), street.name, street.kind});
        }
    }
}

/// Points that lie within the same tenth of a metre are one.
int StreetGraph::vertexAt(const QPointF& point)
{
    const QPair<qint64, qint64> key(qRound64(point.x() * 10), qRound64(point.y() * 10));
    const auto known = m_vertexAt.constFind(key);
    if (known != m_vertexAt.constEnd())
        return *known;
    m_vertices.append(point);
    m_edgesAt.append(QVector<int>());
    return *m_vertexAt.insert(key, int(m_vertices.size()) - 1);
}

StreetGraph::Spot StreetGraph::nearest(const QPointF& point) const
{
    Spot best{-1, 0, {}};
    double shortest = never;
    for (int i = 0; i < m_edges.size(); ++i) {
        const Edge& edge = m_edges.at(i);
        if (edge.length <= 0)
            continue;
        const QPointF start = m_vertices.at(edge.from);
        const QPointF way = (m_vertices.at(edge.to) - start) / edge.length;
        const double along = std::clamp(QPointF::dotProduct(point - start, way), 0.0, edge.length);
        const QPointF foot = start + way * along;
        const double distance = QLineF(point, foot).length();
        if (distance < shortest) {
            shortest = distance;
            best = {i, along, foot};
        }
    }
    return best;
}

QVector<StreetGraph::Arrival> StreetGraph::search(const Spot& start, bool avoidMotorways) const
{
    QVector<Arrival> arrivals(m_vertices.size(), {never, -1});
    using Entry = std::pair<double, int>;
    std::priority_queue<Entry, std::vector<Entry>, std::greater<>> open;
    const auto reach = [&](int vertex, double seconds, int edge) {
        if (seconds >= arrivals.at(vertex).seconds)
            return;
        arrivals[vertex] = {seconds, edge};
        open.emplace(seconds, vertex);
    };
    const Edge& first = m_edges.at(start.edge);
    reach(first.from, start.along / speedOn(first.kind), start.edge);
    reach(first.to, (first.length - start.along) / speedOn(first.kind), start.edge);
    while (!open.empty()) {
        const auto [seconds, vertex] = open.top();
        open.pop();
        if (seconds > arrivals.at(vertex).seconds)
            continue;
        for (const int next : m_edgesAt.at(vertex)) {
            const Edge& edge = m_edges.at(next);
            if (!avoidMotorways || edge.kind != StreetClass::Motorway)
                reach(otherEnd(edge, vertex), seconds + edge.length / speedOn(edge.kind), next);
        }
    }
    return arrivals;
}

Route StreetGraph::route(const QPointF& from, const QPointF& to, bool avoidMotorways) const
{
    const Spot start = nearest(from);
    const Spot goal = nearest(to);
    if (start.edge < 0)
        return {};
    if (start.edge == goal.edge)
        return between(start, goal);
    const auto arrivals = search(start, avoidMotorways);
    const Edge& last = m_edges.at(goal.edge);
    const double overFrom = arrivals.at(last.from).seconds + goal.along / speedOn(last.kind);
    const double overTo = arrivals.at(last.to).seconds + (last.length - goal.along) / speedOn(last.kind);
    if (std::min(overFrom, overTo) == never)
        return {};
    return trace(start, goal, arrivals, overFrom <= overTo ? last.from : last.to);
}

Route StreetGraph::between(const Spot& start, const Spot& goal) const
{
    const Edge& edge = m_edges.at(start.edge);
    Route route;
    route.points << start.point << goal.point;
    route.legs.append({edge.street, speedOn(edge.kind)});
    route.complete({false, false});
    return route;
}

/// Back from the goal over the vertices, by the edges that each was reached by.
Route StreetGraph::trace(const Spot& start, const Spot& goal, const QVector<Arrival>& arrivals, int last) const
{
    Route route;
    QVector<bool> isJunction;
    const auto add = [&](const QPointF& point, int edge, bool junction) {
        if (!route.points.isEmpty() && point == route.points.constLast())
            return; // the start or the goal lies on a vertex
        if (!route.points.isEmpty())
            route.legs.append({m_edges.at(edge).street, speedOn(m_edges.at(edge).kind)});
        route.points.append(point);
        isJunction.append(junction);
    };
    add(goal.point, goal.edge, false);
    int edge = goal.edge;
    int vertex = last;
    while (true) {
        add(m_vertices.at(vertex), edge, m_edgesAt.at(vertex).size() > 2);
        edge = arrivals.at(vertex).edge;
        if (edge == start.edge)
            break;
        vertex = otherEnd(m_edges.at(edge), vertex);
    }
    add(start.point, start.edge, false);
    std::reverse(route.points.begin(), route.points.end());
    std::reverse(route.legs.begin(), route.legs.end());
    std::reverse(isJunction.begin(), isJunction.end());
    if (route.isEmpty())
        return {};
    route.complete(isJunction);
    return route;
}
