// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonArray>
#include <QJsonObject>
#include <QList>
#include <QString>

class QObject;

/// What the bridge's table says about each class that has an instance, bases included.
struct TableSource
{
    QString name;
    QJsonArray state;
    QJsonArray calls;
    QJsonArray events;
    QJsonArray enums;

    QObject* instance() const;
    /// The enumeration of this name, or an empty object.
    QJsonObject enumeration(const QString& name) const;
    /// A value of the type that is not the default; \a salt 0 or 1 for two different ones.
    QJsonValue sample(const QJsonObject& item, int salt) const;
    QJsonValue initial(const QJsonObject& item) const;
};

QList<TableSource> readSourceTable();
