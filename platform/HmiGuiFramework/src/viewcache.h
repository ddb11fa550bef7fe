// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QPointer>
#include <QQuickItem>
#include <QStringList>
#include <QUrl>

#include <memory>

QT_BEGIN_NAMESPACE
class QQmlComponent;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiGuiFramework {

/// The items of views and popups: made on first use, the most recently used ones kept.
class ViewCache
{
public:
    explicit ViewCache(QQmlEngine* engine);
    ~ViewCache();
    Q_DISABLE_COPY(ViewCache)

    /// The item under this name, made from \a url when there is none, invisible at first. Null when it cannot be made;
    /// \a error then says why.
    QQuickItem* item(const QString& name, const QUrl& url, QString* error);

    /// The item under this name, or null.
    QQuickItem* existing(const QString& name) const { return m_items.value(name); }

    /// Drops the least recently used items until \a limit are left; those of \a pinned neither go nor count.
    void trim(int limit, const QStringList& pinned);

    /// Drops all items and compiled components. Items are deleted when control returns to the event loop.
    void clear();

    /// Deletes all items and components at once: the engine is gone, and no more can be made.
    void engineDestroyed();

private:
    void drop(const QString& name);

    QQmlEngine* m_engine; // null when gone
    QHash<QUrl, std::shared_ptr<QQmlComponent>> m_components;
    QHash<QString, QPointer<QQuickItem>> m_items;
    QStringList m_recent; // last is the most recently used
};

} // namespace HmiGuiFramework
