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

    /// Empty, or what is wrong with a call that arrived.
    QString check(const QString& source, const QString& call, const QJsonArray& arguments) const;

private:
    CallTable();

    struct Entry
    {
        QHash<QString, QJsonArray> calls; ///< name and arguments
        QStringList callNames;
        QStringList stateNames;
        bool isAbstract = false;
    };

    QHash<QString, Entry> m_sources;
    QStringList m_names;
};

} // namespace HmiVehicle
