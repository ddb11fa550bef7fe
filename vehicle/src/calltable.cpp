// SPDX-License-Identifier: MIT
#include "calltable.h"

#include <QFile>
#include <QJsonDocument>

#include <cmath>

static void loadResource()
{
    Q_INIT_RESOURCE(vehicletable); // a static library's resources are not registered by themselves
}

namespace HmiVehicle {

namespace {

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
    return value.isDouble() && std::trunc(number) == number && std::abs(number) < 2147483648.0;
}

} // namespace

const CallTable& CallTable::instance()
{
    static const CallTable table;
    return table;
}

CallTable::CallTable()
{
    loadResource();
    QFile file(QStringLiteral(":/HmiVehicle/sources.json"));
    if (!file.open(QIODevice::ReadOnly))
        qFatal("the table of sources is not in the program");
    const QJsonArray sources =
        QJsonDocument::fromJson(file.readAll()).object().value(QLatin1String("sources")).toArray();
    for (const QJsonValue value : sources) {
        const QJsonObject source = value.toObject();
        Entry entry = m_sources.value(source.value(QLatin1String("base")).toString());
        entry.isAbstract = source.value(QLatin1String("abstract")).toBool();
        const QJsonArray calls = source.value(QLatin1String("calls")).toArray();
        for (const QJsonValue call : calls) {
            entry.calls.insert(nameOf(call), call.toObject().value(QLatin1String("args")).toArray());
            entry.callNames.append(nameOf(call));
        }
        const QJsonArray state = source.value(QLatin1String("state")).toArray();
        for (const QJsonValue field : state)
            entry.stateNames.append(nameOf(field));
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
