// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QJsonArray>
#include <QJsonObject>
#include <QString>
#include <QStringList>

namespace HmiVehicle {

/// The protocol's table of sources, as far as a vehicle needs it.
class CallTable
{
public:
    static const CallTable& instance();

    QStringList sources() const; ///< those that have an instance
    QStringList callsOf(const QString& source) const;
    QStringList stateOf(const QString& source) const;

    /// The type of a field as the table calls it, empty for one that is not there.
    QString typeOf(const QString& source, const QString& field) const;
    /// Empty, or why a field cannot have this value.
    QString checkState(const QString& source, const QString& field, const QJsonValue& value) const;
    /// How many arguments a call has, -1 when it is not there.
    int argumentCount(const QString& source, const QString& call) const;

    /// Empty, or what is wrong with a call that arrived.
    QString check(const QString& source, const QString& call, const QJsonArray& arguments) const;

private:
    CallTable();

    struct Entry
    {
        QHash<QString, QJsonArray> calls; ///< name and arguments
        QHash<QString, QJsonObject> state;
        QHash<QString, QJsonObject> enums;
        QStringList callNames;
        QStringList stateNames;
        bool isAbstract = false;
    };

    QJsonObject field(const QString& source, const QString& name) const;
    QString checkRecords(const QJsonObject& field, const QJsonArray& records) const;
    static QString checkValue(const QJsonObject& field, const QJsonObject& enumeration, const QJsonValue& value);

    QHash<QString, QJsonArray> m_records; ///< name and fields
    QHash<QString, Entry> m_sources;
    QStringList m_names;
};

} // namespace HmiVehicle
