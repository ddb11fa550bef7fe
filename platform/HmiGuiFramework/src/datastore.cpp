// SPDX-License-Identifier: MIT
#include "datastore.h"

#include <QHash>
#include <QPointer>

namespace HmiGuiFramework {

namespace {
QHash<QString, QPointer<QObject>>& objects()
{
    static QHash<QString, QPointer<QObject>> byName;
    return byName;
}
} // namespace

void DataStore::store(QObject* object, const QString& name)
{
    if (object)
        objects().insert(name, object);
    else
        objects().remove(name);
}

QObject* DataStore::find(const QString& name)
{
    return objects().value(name);
}

} // namespace HmiGuiFramework
