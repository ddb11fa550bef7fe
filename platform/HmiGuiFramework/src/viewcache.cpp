// SPDX-License-Identifier: MIT
#include "viewcache.h"

#include <QQmlComponent>
#include <QQmlEngine>

#include <utility>

namespace HmiGuiFramework {

ViewCache::ViewCache(QQmlEngine* engine)
    : m_engine(engine)
{
}

ViewCache::~ViewCache()
{
    engineDestroyed();
}

void ViewCache::engineDestroyed()
{
    m_engine = nullptr;
    m_recent.clear();
    m_components.clear();
    const auto items = std::exchange(m_items, {});
    for (const auto& item : items)
        delete item.data();
}

QQuickItem* ViewCache::item(const QString& name, const QUrl& url, QString* error)
{
    m_recent.removeAll(name);
    if (QQuickItem* const known = existing(name)) {
        m_recent.append(name);
        return known;
    }
    if (!m_engine) {
        *error = QStringLiteral("the QML engine is gone");
        return nullptr;
    }
    auto& component = m_components[url];
    if (!component)
        component = std::make_shared<QQmlComponent>(m_engine, url, QQmlComponent::PreferSynchronous);
    std::unique_ptr<QObject> object(component->isReady() ? component->create() : nullptr);
    auto* const item = qobject_cast<QQuickItem*>(object.get());
    if (!item) {
        *error = component->isError() ? component->errorString().trimmed() : QStringLiteral("its root is not an item");
        m_components.remove(url); // a repaired file gets another chance
        return nullptr;
    }
    static_cast<void>(object.release()); // the cache owns it from here
    QQmlEngine::setObjectOwnership(item, QQmlEngine::CppOwnership);
    item->setVisible(false);
    m_items.insert(name, item);
    m_recent.append(name);
    return item;
}

void ViewCache::trim(int limit, const QStringList& pinned)
{
    QStringList candidates;
    for (const QString& name : std::as_const(m_recent))
        if (!pinned.contains(name))
            candidates.append(name);
    for (int i = 0; i < candidates.size() - limit; ++i)
        drop(candidates.at(i));
}

void ViewCache::clear()
{
    const QStringList names = m_recent;
    for (const QString& name : names)
        drop(name);
    m_components.clear();
}

void ViewCache::drop(const QString& name)
{
    m_recent.removeAll(name);
    if (QQuickItem* const item = m_items.take(name)) {
        item->setVisible(false);
        item->deleteLater();
    }
}

} // namespace HmiGuiFramework
