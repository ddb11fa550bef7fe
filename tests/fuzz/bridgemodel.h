// SPDX-License-Identifier: MIT
#pragma once

#include "sourcetable.h"

#include <AL2HMIBridge/BridgeEndpoint>

#include <QByteArray>
#include <QHash>
#include <QJsonObject>
#include <QMap>
#include <QStringList>
#include <QVariant>
#include <QVector>

/// What the sources have to say after some traffic, worked out apart from the bridge: from the table of sources and its rules.
class BridgeModel
{
public:
    using Channel = AL2HMIBridge::BridgeEndpoint::Channel;

    BridgeModel();

    /// All at their defaults, nobody connected, nothing expected.
    void reset();

    /// The channel on which a line belongs, as far as it tells.
    Channel channelOf(const QByteArray& line) const;

    /// One line outside of any connection; false for one that must be refused.
    bool take(const QByteArray& line, Channel channel);

    void connectPeer(Channel channel);
    /// Bytes as they arrive; false when the HMI has to hang up.
    bool receive(Channel channel, const QByteArray& bytes);
    void hangUp(Channel channel);
    bool greeted(Channel channel) const { return m_connections[channel].greeted; }
    bool synchronised() const { return m_synchronised; }

    int refusals() const { return m_refusals; }     ///< lines that were refused since reset()
    QStringList events() const { return m_events; } ///< that were emitted since reset(), such as "keyEvent 7 0"
    QVariant value(const QString& source, const QString& field) const;

    /// Empty when the sources say what they have to, or which field does not.
    QString difference() const;

private:
    struct Field
    {
        QJsonObject item;
        QVariant initial;
        QVariant value;
    };
    struct Source
    {
        TableSource table;
        QObject* instance;
        Channel channel;
        QVector<Field> fields;
        QHash<QString, int> places;
    };
    using Values = QMap<QPair<QString, int>, QVariant>; ///< by source and place of the field
    struct Connection
    {
        bool open = false;
        bool greeted = false;
        bool gathering = false;
        bool skipping = false;
        QByteArray partial;
        Values snapshot;
    };

    bool receiveLine(Connection& connection, Channel channel, const QByteArray& line);
    bool readState(const Source& source, const QJsonObject& line, Values* values) const;
    bool readEvent(const Source& source, const QJsonObject& line, QString* event) const;
    bool readValue(const TableSource& table, const QJsonObject& item, const QJsonValue& json, QVariant* value) const;
    bool readRecords(const QJsonObject& item, const QJsonValue& json, QVariant* value) const;
    void apply(const Values& values);
    void close(Connection& connection, Channel channel);
    const Source* sourceOf(const QJsonObject& line) const;

    QHash<QString, Source> m_sources;
    QHash<QString, QJsonArray> m_records;
    Connection m_connections[3];
    bool m_synchronised = false;
    int m_refusals = 0;
    QStringList m_events;
};
