// SPDX-License-Identifier: MIT
#include "bridgemodel.h"

#include <QFile>
#include <QJsonDocument>

#include <cmath>
#include <limits>

using AL2HMIBridge::BridgeEndpoint;

namespace {

constexpr int longestLine = 1024 * 1024; ///< bytes, with its end
constexpr double realLimit = 1e15;
constexpr int textLimit = 4096;
constexpr int listLimit = 1000;

bool isWholeNumber(const QJsonValue& json, double least, double most, int* number)
{
    if (!json.isDouble())
        return false;
    const double value = json.toDouble();
    if (std::trunc(value) != value || value < least || value > most)
        return false;
    *number = int(value);
    return true;
}

bool isInt(const QJsonValue& json, int* number)
{
    return isWholeNumber(json, std::numeric_limits<int>::min(), std::numeric_limits<int>::max(), number);
}

bool isGreeting(const QJsonObject& line)
{
    return line.size() == 2 && line.value(QStringLiteral("protocol")) == QJsonValue(1)
           && line.value(QStringLiteral("peer")) == QJsonValue(QStringLiteral("application-layer"));
}

bool isSnapshotEnd(const QJsonObject& line)
{
    return line.size() == 1 && line.value(QStringLiteral("snapshot")) == QJsonValue(QStringLiteral("complete"));
}

QJsonObject objectOf(const QByteArray& line)
{
    return QJsonDocument::fromJson(line).object();
}

bool isObject(const QByteArray& line)
{
    return QJsonDocument::fromJson(line).isObject();
}

/// Enumerations are read as numbers.
bool sameValue(const QVariant& said, const QVariant& expected)
{
    if (expected.userType() == QMetaType::Int)
        return said.toInt() == expected.toInt();
    if (expected.userType() == qMetaTypeId<QList<int>>())
        return said.value<QList<int>>() == expected.value<QList<int>>();
    return said == expected;
}

} // namespace

BridgeModel::BridgeModel()
{
    QFile file(QStringLiteral(BRIDGE_TABLE));
    if (!file.open(QIODevice::ReadOnly))
        qFatal("no table of sources");
    const QJsonArray records = objectOf(file.readAll()).value(QStringLiteral("records")).toArray();
    for (const QJsonValue record : records)
        m_records.insert(record.toObject().value(QStringLiteral("name")).toString(),
                         record.toObject().value(QStringLiteral("fields")).toArray());
    const QList<TableSource> table = readSourceTable();
    for (const TableSource& row : table) {
        Source source{row, row.instance(), BridgeEndpoint::Messages, {}, {}};
        if (row.name == QLatin1String("KeySource"))
            source.channel = BridgeEndpoint::Priority;
        for (const QJsonValue item : row.state) {
            Field field{item.toObject(), {}, {}};
            if (!readValue(row, field.item, row.initial(field.item), &field.initial))
                qFatal("%s has a field without a default", qPrintable(row.name));
            source.places.insert(field.item.value(QStringLiteral("name")).toString(), int(source.fields.size()));
            source.fields.append(field);
        }
        m_sources.insert(row.name, source);
    }
    TableSource touch;
    touch.name = QStringLiteral("TouchInput");
    touch.events = {QJsonObject{{QStringLiteral("name"), QStringLiteral("passThroughViewTouched")}}};
    m_sources.insert(touch.name, {touch, nullptr, BridgeEndpoint::Touch, {}, {}});
    reset();
}

void BridgeModel::reset()
{
    for (Source& source : m_sources)
        for (Field& field : source.fields)
            field.value = field.initial;
    for (Connection& connection : m_connections)
        connection = Connection();
    m_synchronised = false;
    m_refusals = 0;
    m_events.clear();
}

const BridgeModel::Source* BridgeModel::sourceOf(const QJsonObject& line) const
{
    const auto source = m_sources.constFind(line.value(QStringLiteral("source")).toString());
    return source == m_sources.constEnd() ? nullptr : &*source;
}

BridgeModel::Channel BridgeModel::channelOf(const QByteArray& line) const
{
    const Source* const source = sourceOf(objectOf(line));
    return source ? source->channel : BridgeEndpoint::Messages;
}

bool BridgeModel::take(const QByteArray& line, Channel channel)
{
    if (!isObject(line))
        return false;
    const QJsonObject object = objectOf(line);
    if (object.contains(QStringLiteral("protocol")))
        return isGreeting(object);
    if (object.contains(QStringLiteral("snapshot")))
        return isSnapshotEnd(object) && channel == BridgeEndpoint::Messages;
    const Source* const source = sourceOf(object);
    if (!source || source->channel != channel)
        return false;
    if (object.contains(QStringLiteral("state"))) {
        Values values;
        if (!readState(*source, object, &values))
            return false;
        apply(values);
        return true;
    }
    QString event;
    if (!readEvent(*source, object, &event))
        return false;
    m_events.append(event);
    return true;
}

void BridgeModel::connectPeer(Channel channel)
{
    m_connections[channel] = Connection();
    m_connections[channel].open = true;
}

void BridgeModel::close(Connection& connection, Channel channel)
{
    connection = Connection();
    if (channel == BridgeEndpoint::Messages)
        m_synchronised = false;
}

void BridgeModel::hangUp(Channel channel)
{
    Connection& connection = m_connections[channel];
    if (connection.open && !connection.partial.isEmpty())
        ++m_refusals; // half a line
    close(connection, channel);
}

bool BridgeModel::receive(Channel channel, const QByteArray& bytes)
{
    Connection& connection = m_connections[channel];
    for (int from = 0; connection.open && from < bytes.size();) {
        const int end = int(bytes.indexOf('\n', from));
        connection.partial += bytes.mid(from, end < 0 ? -1 : end - from);
        if (connection.skipping) {
            connection.partial.clear();
        } else if (connection.partial.size() >= longestLine) {
            connection.skipping = true;
            connection.partial.clear();
            ++m_refusals;
        }
        if (end < 0)
            break;
        from = end + 1;
        const QByteArray line = std::exchange(connection.partial, QByteArray());
        if (!std::exchange(connection.skipping, false) && !receiveLine(connection, channel, line)) {
            close(connection, channel);
            return false;
        }
    }
    return connection.open;
}

bool BridgeModel::receiveLine(Connection& connection, Channel channel, const QByteArray& line)
{
    const QJsonObject object = objectOf(line);
    if (!connection.greeted) {
        connection.greeted = isGreeting(object);
        connection.gathering = channel == BridgeEndpoint::Messages;
        m_refusals += connection.greeted ? 0 : 1;
        return connection.greeted;
    }
    const bool isEnd = isSnapshotEnd(object) && channel == BridgeEndpoint::Messages;
    const bool isFurtherGreeting = object.contains(QStringLiteral("protocol"));
    if (isFurtherGreeting || (isEnd && !connection.gathering)) {
        ++m_refusals;
    } else if (isEnd) {
        for (auto source = m_sources.begin(); source != m_sources.end(); ++source)
            for (int place = 0; place < source->fields.size(); ++place)
                source->fields[place].value =
                    connection.snapshot.value({source.key(), place}, source->fields.at(place).initial);
        connection.gathering = false;
        connection.snapshot.clear();
        m_synchronised = true;
    } else if (connection.gathering && object.contains(QStringLiteral("state"))) {
        const Source* const source = sourceOf(object);
        Values values;
        if (!object.contains(QStringLiteral("snapshot")) && source && source->channel == channel
            && readState(*source, object, &values))
            for (auto value = values.constBegin(); value != values.constEnd(); ++value)
                connection.snapshot.insert(value.key(), *value);
        else
            ++m_refusals;
    } else if (!take(line, channel)) {
        ++m_refusals;
    }
    return true;
}

bool BridgeModel::readState(const Source& source, const QJsonObject& line, Values* values) const
{
    const QJsonValue state = line.value(QStringLiteral("state"));
    if (line.size() != 2 || !state.isObject())
        return false;
    const QJsonObject fields = state.toObject();
    for (auto field = fields.constBegin(); field != fields.constEnd(); ++field) {
        const int place = source.places.value(field.key(), -1);
        QVariant value;
        if (place < 0 || !readValue(source.table, source.fields.at(place).item, field.value(), &value))
            return false;
        values->insert({source.table.name, place}, value);
    }
    return true;
}

bool BridgeModel::readEvent(const Source& source, const QJsonObject& line, QString* event) const
{
    const QJsonValue name = line.value(QStringLiteral("event"));
    const QJsonValue arguments = line.value(QStringLiteral("args"));
    if (line.size() != 3 || !name.isString() || !arguments.isArray())
        return false;
    for (const QJsonValue known : source.table.events) {
        if (known.toObject().value(QStringLiteral("name")) != name)
            continue;
        const QJsonArray wanted = known.toObject().value(QStringLiteral("args")).toArray();
        const QJsonArray given = arguments.toArray();
        *event = name.toString();
        for (int i = 0; i < wanted.size(); ++i) {
            QVariant value;
            if (!readValue(source.table, wanted.at(i).toObject(), given.at(i), &value))
                return false;
            *event += QLatin1Char(' ') + value.toString();
        }
        return given.size() == wanted.size();
    }
    return false;
}

bool BridgeModel::readValue(const TableSource& table, const QJsonObject& item, const QJsonValue& json,
                            QVariant* value) const
{
    const QString type = item.value(QStringLiteral("type")).toString();
    const QJsonValue most = item.value(QStringLiteral("max"));
    int number = 0;
    if (type == QLatin1String("bool")) {
        *value = json.toBool();
        return json.isBool();
    }
    if (type == QLatin1String("int")) {
        const double least = item.value(QStringLiteral("min")).toDouble(std::numeric_limits<int>::min());
        const bool isNumber = isWholeNumber(json, least, most.toDouble(std::numeric_limits<int>::max()), &number);
        *value = number;
        return isNumber;
    }
    if (type == QLatin1String("real")) {
        const double real = json.toDouble();
        *value = real;
        return json.isDouble() && std::isfinite(real) && real >= item.value(QStringLiteral("min")).toDouble(-realLimit)
               && real <= most.toDouble(realLimit);
    }
    if (type == QLatin1String("text")) {
        *value = json.toString();
        return json.isString() && value->toString().size() <= most.toInt(textLimit);
    }
    if (type == QLatin1String("intList")) {
        QList<int> list;
        const QJsonArray array = json.toArray();
        for (const QJsonValue element : array) {
            if (!isInt(element, &number))
                return false;
            list.append(number);
        }
        *value = QVariant::fromValue(list);
        return json.isArray() && array.size() <= most.toInt(listLimit);
    }
    if (type == QLatin1String("records"))
        return readRecords(item, json, value);

    // An enumeration; an open one takes any number.
    if (!isInt(json, &number))
        return false;
    *value = number;
    const QJsonObject enumeration = table.enumeration(type);
    if (enumeration.value(QStringLiteral("open")).toBool())
        return true;
    const QJsonArray known = enumeration.value(QStringLiteral("values")).toArray();
    for (const QJsonValue one : known)
        if (one.toObject().value(QStringLiteral("value")).toInt() == number)
            return true;
    return false;
}

bool BridgeModel::readRecords(const QJsonObject& item, const QJsonValue& json, QVariant* value) const
{
    const QJsonArray fields = m_records.value(item.value(QStringLiteral("record")).toString());
    const QJsonArray array = json.toArray();
    if (!json.isArray() || array.size() > item.value(QStringLiteral("max")).toInt(listLimit))
        return false;
    QVariantList list;
    for (const QJsonValue entry : array) {
        const QJsonObject object = entry.toObject();
        if (!entry.isObject() || object.size() != fields.size())
            return false;
        QVariantMap map;
        for (const QJsonValue field : fields) {
            const QString name = field.toObject().value(QStringLiteral("name")).toString();
            QVariant one;
            if (!object.contains(name) || !readValue(TableSource(), field.toObject(), object.value(name), &one))
                return false;
            map.insert(name, one);
        }
        list.append(map);
    }
    *value = list;
    return true;
}

void BridgeModel::apply(const Values& values)
{
    for (auto value = values.constBegin(); value != values.constEnd(); ++value)
        m_sources[value.key().first].fields[value.key().second].value = *value;
}

QVariant BridgeModel::value(const QString& source, const QString& field) const
{
    const auto known = m_sources.constFind(source);
    return known->fields.at(known->places.value(field)).value;
}

QString BridgeModel::difference() const
{
    for (const Source& source : m_sources) {
        for (const Field& field : source.fields) {
            const QString name = field.item.value(QStringLiteral("name")).toString();
            const QVariant said = source.instance->property(name.toLatin1().constData());
            if (!sameValue(said, field.value))
                return QStringLiteral("%1.%2 says %3 instead of %4")
                    .arg(source.table.name, name, said.toString(), field.value.toString());
        }
    }
    return QString();
}
