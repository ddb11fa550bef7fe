// SPDX-License-Identifier: MIT
#pragma once

#include <QPointF>
#include <QString>
#include <QStringList>
#include <QVector>

QT_BEGIN_NAMESPACE
class QQuickItem;
QT_END_NAMESPACE

/// \brief A finger and a pair of eyes for a tour: finds what is on the screen by object name and touches it. GUI thread only.
namespace ScreenHand {

/// \brief The item of this name that is on the screen, the topmost one of several; null when there is none.
QQuickItem* find(const QString& objectName);
/// \brief The key of the on-screen keyboard that types \a text.
QQuickItem* findKey(const QString& text);
/// \brief What can be read in \a item, in the order of its items.
QStringList texts(QQuickItem* item);

void tap(QQuickItem* item); ///< in its middle
/// \brief Draws a line over \a points, in the item's coordinates.
void draw(QQuickItem* item, const QVector<QPointF>& points);

} // namespace ScreenHand
