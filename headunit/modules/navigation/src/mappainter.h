// SPDX-License-Identifier: MIT
#pragma once

#include "town.h"

#include <QColor>
#include <QFont>
#include <QHash>
#include <QImage>
#include <QPolygonF>

#include <memory>

/// \brief Everything that a picture of a map is drawn from. A value; any thread.
struct MapPicture
{
    std::shared_ptr<const Town> town;
    QPointF centre;                ///< metres
    double zoom = 1;               ///< pixels per metre
    QSize size;                    ///< pixels
    QPolygonF route;               ///< metres; empty for none
    QHash<QString, QColor> colors; ///< by the names that Map.qml gives them
    QFont font;
    double unit = 1; ///< pixels of a reference pixel

    QRectF area() const; ///< what it shows, in metres
    QImage draw() const;
};
