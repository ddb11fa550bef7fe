// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/InputMethodEngineInterface>

#include <QCoreApplication>
#include <QJsonArray>
#include <QJsonObject>
#include <QPluginLoader>
#include <QTest>

/// Loads a plugin, whose keys have to be \a keys, and registers each, as two applications of the same process do.
inline void registerPlugin(const QString& file, const QStringList& keys, const QString& foreignKey)
{
    QObject* const parent = QCoreApplication::instance();
    QPluginLoader loader(file);
    auto* const plugin = qobject_cast<HmiCore::InputMethodEngineInterface*>(loader.instance());
    QVERIFY2(plugin, qPrintable(loader.errorString()));
    const auto listed = loader.metaData().value(QLatin1String("MetaData")).toObject().value(QLatin1String("Keys"));
    QCOMPARE(listed.toArray(), QJsonArray::fromStringList(keys));
    QVERIFY(!plugin->registerEngine(foreignKey, parent));
    QVERIFY(!plugin->registerEngine(QString(), parent));
    for (const QString& key : keys)
        for (int application = 0; application < 2; ++application)
            QVERIFY(plugin->registerEngine(key, parent));
}
