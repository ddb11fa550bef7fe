// SPDX-License-Identifier: MIT
#pragma once

#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiGuiFramework/WindowManager>

#include <QQuickItem>
#include <QQuickWindow>
#include <QSignalSpy>
#include <QTest>

#include <functional>

/// What a person sees and touches: items are found as they lie on the screen, by object name.
namespace Screen {

inline HmiGuiFramework::ViewManager* views()
{
    return HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"));
}

inline QQuickWindow* window()
{
    return HmiGuiFramework::DataStore::get<HmiGuiFramework::WindowManager>(QStringLiteral("WindowManager"))
        ->hmiWindow();
}

inline void visit(QQuickItem* item, const std::function<void(QQuickItem*)>& visitor)
{
    if (!item->isVisible())
        return;
    visitor(item);
    const auto children = item->childItems();
    for (QQuickItem* const child : children)
        visit(child, visitor);
}

inline QQuickItem* find(const char* objectName)
{
    QQuickItem* found = nullptr;
    visit(views()->stage(), [&](QQuickItem* item) {
        if (item->objectName() == QLatin1String(objectName))
            found = item;
    });
    return found;
}

/// The text that the item of this name shows, or a null string when it is not on the screen.
inline QString text(const char* objectName)
{
    const QQuickItem* const item = find(objectName);
    return item ? item->property("text").toString() : QString();
}

/// Waits until what has changed is laid out and drawn.
inline bool isDrawn()
{
    QSignalSpy drawn(window(), &QQuickWindow::frameSwapped);
    window()->update();
    return drawn.wait();
}

/// Touches the middle of an item. False when it is not on the screen.
inline bool tap(const char* objectName)
{
    const QQuickItem* const item = isDrawn() ? find(objectName) : nullptr;
    if (!item)
        return false;
    const QPointF middle = item->mapToScene(QPointF(item->width() / 2, item->height() / 2));
    QTest::mouseClick(window(), Qt::LeftButton, Qt::NoModifier, middle.toPoint());
    return true;
}

inline bool shows(const char* view)
{
    return QTest::qWaitFor([view] { return views()->currentView() == QLatin1String(view); }) && isDrawn();
}

/// A path of object names and types that helps to find an item in the QML files.
inline QString pathOf(const QQuickItem* item)
{
    QStringList parts;
    for (; item; item = item->parentItem())
        parts.prepend(item->objectName().isEmpty()
                          ? QString::fromLatin1(item->metaObject()->className()).section(QLatin1Char('_'), 0, 0)
                          : item->objectName());
    return parts.join(QLatin1Char('/'));
}

} // namespace Screen
