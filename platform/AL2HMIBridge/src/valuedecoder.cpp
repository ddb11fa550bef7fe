// SPDX-License-Identifier: MIT
#include "valuedecoder.h"

#include "bridgelog.h"

#include <QJsonArray>
#include <QJsonObject>

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

namespace AL2HMIBridge {

namespace {

QString decodeInt(const QJsonValue& json, const ValueShape& shape, Value* value)
{
    const double number = json.toDouble(std::numeric_limits<double>::quiet_NaN());
    if (!json.isDouble() || std::trunc(number) != number)
        return QStringLiteral("not an integer");
    if (number < shape.minimum || number > shape.maximum)
        return QStringLiteral("%1 is out of range").arg(number, 0, 'g', 12);
    const int integer = int(number);
    if (shape.known.count && std::find(shape.known.begin(), shape.known.end(), integer) == shape.known.end())
        return QStringLiteral("%1 is not in the enumeration").arg(integer);
    *value = integer;
    return QString();
}

QString decodeReal(const QJsonValue& json, const ValueShape& shape, Value* value)
{
    const double number = json.toDouble(std::numeric_limits<double>::quiet_NaN());
    if (!json.isDouble() || !std::isfinite(number))
        return QStringLiteral("not a number");
    if (number < shape.minimum || number > shape.maximum)
        return QStringLiteral("%1 is out of range").arg(number, 0, 'g', 12);
    *value = number;
    return QString();
}

QString decodeText(const QJsonValue& json, const ValueShape& shape, Value* value)
{
    if (!json.isString())
        return QStringLiteral("not a text");
    QString text = json.toString();
    if (text.size() > shape.maximum)
        return QStringLiteral("longer than %1").arg(shape.maximum);
    *value = std::move(text);
    return QString();
}

QString decodeIntList(const QJsonValue& json, const ValueShape& shape, Value* value)
{
    if (!json.isArray())
        return QStringLiteral("not an array");
    const QJsonArray array = json.toArray();
    if (array.size() > shape.maximum)
        return QStringLiteral("more than %1 entries").arg(shape.maximum);
    const ValueShape entry{ValueType::Int,
                           std::numeric_limits<int>::min(),
                           std::numeric_limits<int>::max(),
                           {},
                           nullptr};
    QList<int> list;
    list.reserve(array.size());
    for (const auto& element : array) {
        Value number;
        const QString problem = decodeInt(element, entry, &number);
        if (!problem.isEmpty())
            return QStringLiteral("entry %1: %2").arg(list.size()).arg(problem);
        list.append(*std::get_if<int>(&number));
    }
    *value = std::move(list);
    return QString();
}

QString decodeRecord(const QJsonObject& object, const Record& record, QVariantMap* map)
{
    if (object.size() != record.fields.count)
        return QStringLiteral("not all and only the fields of %1").arg(record.name);
    for (const Argument& field : record.fields) {
        const auto found = object.constFind(field.name);
        if (found == object.constEnd())
            return QStringLiteral("%1 is missing").arg(field.name);
        Value value;
        const QString problem = decodeValue(found.value(), field.shape, &value);
        if (!problem.isEmpty())
            return QStringLiteral("%1: %2").arg(field.name, problem);
        std::visit([&](auto& plain) { map->insert(field.name, QVariant::fromValue(std::move(plain))); }, value);
    }
    return QString();
}

QString decodeRecords(const QJsonValue& json, const ValueShape& shape, Value* value)
{
    if (!json.isArray())
        return QStringLiteral("not an array");
    const QJsonArray array = json.toArray();
    if (array.size() > shape.maximum)
        return QStringLiteral("more than %1 entries").arg(shape.maximum);
    QVariantList list;
    list.reserve(array.size());
    for (const auto& entry : array) {
        QVariantMap map;
        const QString problem =
            entry.isObject() ? decodeRecord(entry.toObject(), *shape.record, &map) : QStringLiteral("not an object");
        if (!problem.isEmpty())
            return QStringLiteral("entry %1: %2").arg(list.size()).arg(problem);
        list.append(map);
    }
    *value = std::move(list);
    return QString();
}

} // namespace

QString decodeValue(const QJsonValue& json, const ValueShape& shape, Value* value)
{
    switch (shape.type) {
    case ValueType::Bool:
        if (!json.isBool())
            return QStringLiteral("not true or false");
        *value = json.toBool();
        return QString();
    case ValueType::Int:
        return decodeInt(json, shape, value);
    case ValueType::Real:
        return decodeReal(json, shape, value);
    case ValueType::Text:
        return decodeText(json, shape, value);
    case ValueType::IntList:
        return decodeIntList(json, shape, value);
    case ValueType::Records:
        return decodeRecords(json, shape, value);
    }
    return QStringLiteral("of unknown type");
}

} // namespace AL2HMIBridge
