// SPDX-License-Identifier: MIT
#include "calltable.h"

#include "resource.h"

#include <algorithm>
#include <cmath>

namespace HmiVehicle {

namespace {

// The protocol's bounds of what the table says nothing else about.
constexpr int maximumText = 4096;
constexpr int maximumList = 1000;
constexpr double maximumReal = 1e15;

QString nameOf(const QJsonValue& item)
{
    return item.toObject().value(QLatin1String("name")).toString();
}

bool fits(const QJsonValue& value, const QString& type)
{
    if (type == QLatin1String("bool"))
        return value.isBool();
    if (type == QLatin1String("text"))
        return value.isString();
    const double number = value.toDouble(0.5);
    return value.isDouble() && std::trunc(number) == number && number >= -2147483648.0 && number <= 2147483647.0;
}

} // namespace

const CallTable& CallTable::instance()
{
    static const CallTable table;
    return table;
}

CallTable::CallTable()
{
    const QJsonObject document = readResource(QStringLiteral(":/HmiVehicle/sources.json"));
    const QJsonArray records = document.value(QLatin1String("records")).toArray();
    for (const auto& record : records)
        m_records.insert(nameOf(record), record.toObject().value(QLatin1String("fields")).toArray());
    const QJsonArray sources = document.value(QLatin1String("sources")).toArray();
    for (const auto& value : sources) {
        const QJsonObject source = value.toObject();
        Entry entry = m_sources.value(source.value(QLatin1String("base")).toString());
        entry.isAbstract = source.value(QLatin1String("abstract")).toBool();
        const QJsonArray calls = source.value(QLatin1String("calls")).toArray();
        for (const auto& call : calls) {
            entry.calls.insert(nameOf(call), call.toObject().value(QLatin1String("args")).toArray());
            entry.callNames.append(nameOf(call));
        }
        const QJsonArray state = source.value(QLatin1String("state")).toArray();
        for (const auto& field : state) {
            entry.state.insert(nameOf(field), field.toObject());
            entry.stateNames.append(nameOf(field));
        }
        const QJsonArray enums = source.value(QLatin1String("enums")).toArray();
        for (const auto& enumeration : enums)
            entry.enums.insert(nameOf(enumeration), enumeration.toObject());
        m_sources.insert(nameOf(source), entry);
        if (!entry.isAbstract)
            m_names.append(nameOf(source));
    }
}

QStringList CallTable::sources() const
{
    return m_names;
}

QStringList CallTable::callsOf(const QString& source) const
{
    return m_sources.value(source).callNames;
}

QStringList CallTable::stateOf(const QString& source) const
{
    return m_sources.value(source).stateNames;
}

QJsonObject CallTable::field(const QString& source, const QString& name) const
{
    const auto entry = m_sources.constFind(source);
    return entry == m_sources.constEnd() || entry->isAbstract ? QJsonObject() : entry->state.value(name);
}

QString CallTable::typeOf(const QString& source, const QString& name) const
{
    return field(source, name).value(QLatin1String("type")).toString();
}

QString CallTable::checkState(const QString& source, const QString& name, const QJsonValue& value) const
{
    const QJsonObject description = field(source, name);
    const QString type = description.value(QLatin1String("type")).toString();
    if (description.isEmpty())
        return QStringLiteral("there is no %1.%2").arg(source.left(64), name.left(64));
    QString problem;
    if (type == QLatin1String("records"))
        problem = value.isArray() ? checkRecords(description, value.toArray()) : QStringLiteral("not an array");
    else
        problem = checkValue(description, m_sources.value(source).enums.value(type), value);
    return problem.isEmpty() ? problem : QStringLiteral("%1.%2: %3").arg(source, name, problem);
}

QString CallTable::checkRecords(const QJsonObject& description, const QJsonArray& records) const
{
    const QJsonArray fields = m_records.value(description.value(QLatin1String("record")).toString());
    if (records.size() > description.value(QLatin1String("max")).toInt(maximumList))
        return QStringLiteral("too many entries");
    for (const auto& value : records) {
        const QJsonObject record = value.toObject();
        if (record.size() != fields.size())
            return QStringLiteral("a record that has not all fields and no others");
        for (const auto& entry : fields) {
            const QString problem = checkValue(entry.toObject(), QJsonObject(), record.value(nameOf(entry)));
            if (!problem.isEmpty())
                return nameOf(entry) + QStringLiteral(": ") + problem;
        }
    }
    return QString();
}

QString CallTable::checkValue(const QJsonObject& description, const QJsonObject& enumeration, const QJsonValue& value)
{
    const QString type = description.value(QLatin1String("type")).toString();
    const auto limit = [&](const char* name, double otherwise) {
        return description.value(QLatin1String(name)).toDouble(otherwise);
    };
    if (type == QLatin1String("bool"))
        return value.isBool() ? QString() : QStringLiteral("neither true nor false");
    if (type == QLatin1String("text")) {
        const bool isShort = value.toString().size() <= limit("max", maximumText);
        return !value.isString() ? QStringLiteral("not a text") : isShort ? QString() : QStringLiteral("too long");
    }
    if (type == QLatin1String("intList")) {
        const QJsonArray list = value.toArray();
        const bool allFit =
            std::all_of(list.begin(), list.end(), [](const QJsonValue& entry) { return fits(entry, QString()); });
        return value.isArray() && allFit && list.size() <= limit("max", maximumList)
                   ? QString()
                   : QStringLiteral("not a list of numbers, or too long");
    }
    if (!value.isDouble() || (type != QLatin1String("real") && !fits(value, type)))
        return type == QLatin1String("real") ? QStringLiteral("not a number") : QStringLiteral("not a whole number");
    const double number = value.toDouble();
    if (number < limit("min", -maximumReal) || number > limit("max", maximumReal))
        return QStringLiteral("out of range");
    const QJsonArray named = enumeration.value(QLatin1String("values")).toArray();
    const bool isKnown = std::any_of(named.begin(), named.end(), [number](const QJsonValue& known) {
        return known.toObject().value(QLatin1String("value")).toDouble() == number;
    });
    return enumeration.isEmpty() || enumeration.value(QLatin1String("open")).toBool() || isKnown
               ? QString()
               : QStringLiteral("a number that does not exist");
}

int CallTable::argumentCount(const QString& source, const QString& call) const
{
    const auto entry = m_sources.constFind(source);
    if (entry == m_sources.constEnd() || entry->isAbstract || !entry->calls.contains(call))
        return -1;
    return int(entry->calls.value(call).size());
}

QString CallTable::check(const QString& source, const QString& call, const QJsonArray& arguments) const
{
    const auto entry = m_sources.constFind(source);
    if (entry == m_sources.constEnd() || entry->isAbstract)
        return QStringLiteral("no such source");
    const auto signature = entry->calls.constFind(call);
    if (signature == entry->calls.constEnd())
        return QStringLiteral("no such call");
    if (signature->size() != arguments.size())
        return QStringLiteral("%1 arguments instead of %2").arg(arguments.size()).arg(signature->size());
    for (int i = 0; i < arguments.size(); ++i)
        if (!fits(arguments.at(i), signature->at(i).toObject().value(QLatin1String("type")).toString()))
            return QStringLiteral("argument %1 is of another type").arg(i + 1);
    return QString();
}

} // namespace HmiVehicle
