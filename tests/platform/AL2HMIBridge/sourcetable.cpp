// SPDX-License-Identifier: MIT
#include "sourcetable.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/BezelDiagnosticsSource>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/DeveloperSource>
#include <AL2HMIBridge/EAPhoneSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/ProjectionSource>
#include <AL2HMIBridge/SpeechSource>
#include <AL2HMIBridge/ValetModeSource>
#include <AL2HMIBridge/XMTunerSource>

#include <QFile>
#include <QHash>
#include <QJsonDocument>

#include <cmath>
#include <functional>

using namespace AL2HMIBridge;

namespace {

QJsonArray joined(const QJsonArray& first, const QJsonArray& second)
{
    QJsonArray all = first;
    for (const QJsonValue value : second)
        all.append(value);
    return all;
}

QJsonObject recordSample(const QString& name, int salt)
{
    QFile file(QStringLiteral(BRIDGE_TABLE));
    if (!file.open(QIODevice::ReadOnly))
        return QJsonObject();
    const QJsonArray records =
        QJsonDocument::fromJson(file.readAll()).object().value(QStringLiteral("records")).toArray();
    QJsonObject sample;
    for (const QJsonValue record : records) {
        if (record.toObject().value(QStringLiteral("name")).toString() != name)
            continue;
        const QJsonArray fields = record.toObject().value(QStringLiteral("fields")).toArray();
        for (const QJsonValue field : fields)
            sample.insert(field.toObject().value(QStringLiteral("name")).toString(),
                          TableSource{}.sample(field.toObject(), salt));
    }
    return sample;
}

} // namespace

QObject* TableSource::instance() const
{
    static const QHash<QString, std::function<QObject*()>> makers{
        {QStringLiteral("KeySource"), [] { return KeySource::instance(); }},
        {QStringLiteral("GlobalSource"), [] { return GlobalSource::instance(); }},
        {QStringLiteral("SpeechSource"), [] { return SpeechSource::instance(); }},
        {QStringLiteral("PhoneSource"), [] { return PhoneSource::instance(); }},
        {QStringLiteral("EAPhoneSource"), [] { return EAPhoneSource::instance(); }},
        {QStringLiteral("ProjectionSource"), [] { return ProjectionSource::instance(); }},
        {QStringLiteral("AMTunerSource"), [] { return AMTunerSource::instance(); }},
        {QStringLiteral("FMTunerSource"), [] { return FMTunerSource::instance(); }},
        {QStringLiteral("XMTunerSource"), [] { return XMTunerSource::instance(); }},
        {QStringLiteral("DABTunerSource"), [] { return DABTunerSource::instance(); }},
        {QStringLiteral("CDSource"), [] { return CDSource::instance(); }},
        {QStringLiteral("MediaAudioSource"), [] { return MediaAudioSource::instance(); }},
        {QStringLiteral("DeveloperSource"), [] { return DeveloperSource::instance(); }},
        {QStringLiteral("ValetModeSource"), [] { return ValetModeSource::instance(); }},
        {QStringLiteral("BezelDiagnosticsSource"), [] { return BezelDiagnosticsSource::instance(); }},
    };
    const auto maker = makers.value(name);
    return maker ? maker() : nullptr;
}

QJsonObject TableSource::enumeration(const QString& enumName) const
{
    for (const QJsonValue value : enums)
        if (value.toObject().value(QStringLiteral("name")).toString() == enumName)
            return value.toObject();
    return QJsonObject();
}

QJsonValue TableSource::sample(const QJsonObject& item, int salt) const
{
    const QString type = item.value(QStringLiteral("type")).toString();
    const int least = item.value(QStringLiteral("min")).toInt();
    if (type == QLatin1String("bool"))
        return (salt == 0) != item.value(QStringLiteral("default")).toBool();
    if (type == QLatin1String("int"))
        return qMax(least, 1) + salt;
    if (type == QLatin1String("real"))
        return least + 1.25 + salt;
    if (type == QLatin1String("text"))
        return salt ? QStringLiteral("Größe \"1\"") : QStringLiteral("98.5");
    if (type == QLatin1String("intList"))
        return QJsonArray{3, 1, salt};
    if (type == QLatin1String("records"))
        return QJsonArray{recordSample(item.value(QStringLiteral("record")).toString(), 0),
                          recordSample(item.value(QStringLiteral("record")).toString(), salt)};
    const QJsonArray values = enumeration(type).value(QStringLiteral("values")).toArray();
    return values.at(values.size() - 1 - salt).toObject().value(QStringLiteral("value"));
}

QJsonValue TableSource::initial(const QJsonObject& item) const
{
    const QString type = item.value(QStringLiteral("type")).toString();
    const QJsonValue given = item.value(QStringLiteral("default"));
    const QJsonArray values = enumeration(type).value(QStringLiteral("values")).toArray();
    for (const QJsonValue value : values)
        if (value.toObject().value(QStringLiteral("name")) == given)
            return value.toObject().value(QStringLiteral("value"));
    if (!given.isUndefined())
        return given;
    if (type == QLatin1String("bool"))
        return false;
    if (type == QLatin1String("text"))
        return QString();
    if (type == QLatin1String("intList") || type == QLatin1String("records"))
        return QJsonArray();
    return 0;
}

QList<TableSource> readSourceTable()
{
    QFile file(QStringLiteral(BRIDGE_TABLE));
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QJsonArray sources =
        QJsonDocument::fromJson(file.readAll()).object().value(QStringLiteral("sources")).toArray();
    QHash<QString, TableSource> byName;
    QList<TableSource> table;
    for (const QJsonValue value : sources) {
        const QJsonObject source = value.toObject();
        const TableSource base = byName.value(source.value(QStringLiteral("base")).toString());
        const auto list = [&](const QString& kind, const QJsonArray& inherited) {
            return joined(inherited, source.value(kind).toArray());
        };
        const TableSource entry{source.value(QStringLiteral("name")).toString(),
                                list(QStringLiteral("state"), base.state), list(QStringLiteral("calls"), base.calls),
                                list(QStringLiteral("events"), base.events), list(QStringLiteral("enums"), base.enums)};
        byName.insert(entry.name, entry);
        if (!source.value(QStringLiteral("abstract")).toBool() && !source.contains(QStringLiteral("class")))
            table.append(entry);
    }
    return table;
}
