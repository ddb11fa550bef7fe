// SPDX-License-Identifier: MIT
#include "screenhand.h"

#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>

#include <QCoreApplication>
#include <QMouseEvent>
#include <QQuickItem>
#include <QQuickWindow>

#include <functional>

namespace {

QQuickItem* stage()
{
    return HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"))->stage();
}

void visit(QQuickItem* item, const std::function<void(QQuickItem*)>& visitor)
{
    if (!item->isVisible())
        return;
    visitor(item);
    const auto children = item->childItems();
    for (QQuickItem* const child : children)
        visit(child, visitor);
}

QQuickItem* findBy(const char* property, const QString& value)
{
    QQuickItem* found = nullptr;
    visit(stage(), [&](QQuickItem* item) {
        if (item->width() > 0 && item->property(property).toString() == value)
            found = item;
    });
    return found;
}

void send(QQuickItem* item, QEvent::Type type, const QPointF& point, Qt::MouseButtons buttons)
{
    const QPointF place = item->mapToScene(point);
    const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent event(type, place, item->window()->mapToGlobal(place.toPoint()), button, buttons, Qt::NoModifier);
    QCoreApplication::sendEvent(item->window(), &event);
}

} // namespace

QQuickItem* ScreenHand::find(const QString& objectName)
{
    return objectName.isEmpty() ? stage() : findBy("objectName", objectName);
}

QQuickItem* ScreenHand::findKey(const QString& text)
{
    return findBy("typed", text);
}

QStringList ScreenHand::texts(QQuickItem* item)
{
    QStringList all;
    visit(item, [&all](QQuickItem* each) {
        const QString text = each->property("text").toString();
        if (!text.isEmpty() && (each->inherits("QQuickText") || each->inherits("QQuickTextInput")))
            all.append(text);
    });
    return all;
}

void ScreenHand::tap(QQuickItem* item)
{
    draw(item, {QPointF(item->width() / 2, item->height() / 2)});
}

void ScreenHand::draw(QQuickItem* item, const QVector<QPointF>& points)
{
    send(item, QEvent::MouseButtonPress, points.constFirst(), Qt::LeftButton);
    for (const QPointF& point : points)
        send(item, QEvent::MouseMove, point, Qt::LeftButton);
    send(item, QEvent::MouseButtonRelease, points.constLast(), Qt::NoButton);
}
