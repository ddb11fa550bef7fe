// SPDX-License-Identifier: MIT
#pragma once

#include <QPolygonF>
#include <QString>
#include <QVector>

#include <memory>

enum class StreetClass { Minor, Main, Motorway };
enum class AreaKind { Built, Park, Water };

struct Street
{
    QString name;
    StreetClass kind;
    QPolygonF points; ///< two or more; streets that meet share a point
};

struct Area
{
    AreaKind kind;
    QString name; ///< may be empty
    QPolygonF outline;
};

struct Place
{
    QString name;
    QString category; ///< see PlaceCategories
    QPointF at;
};

/// \brief What a map shows and a route is found in. Points are metres, to the east and to the south of some corner.
///
/// Not changed once it is loaded, so any thread may read it.
struct Town
{
    QString name;
    QPointF start;       ///< where the vehicle stands at first
    double heading = 0;  ///< degrees, clockwise from the north
    QVector<Area> areas; ///< in the order in which they are drawn
    QVector<Street> streets;
    QVector<Place> places;
    QRectF bounds; ///< of all streets

    /// \brief Reads a town from a JSON file; null, and what is wrong with which field, when that is not one.
    static std::shared_ptr<const Town> load(const QString& fileName, QString* error);
};
