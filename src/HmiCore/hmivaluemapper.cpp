// SPDX-License-Identifier: MIT
#include "hmivaluemapper.h"

#include "jsonfile.h"
#include "logcategories.h"

#include <QCoreApplication>
#include <QJsonObject>
#include <QQmlEngine>

namespace HmiCore {

namespace {

QMap<int, QVariant> mappingsOf(const QJsonValue& values)
{
    QMap<int, QVariant> mappings;
    const QJsonArray entries = values.toArray();
    for (const QJsonValue& entry : entries) {
        const QJsonObject object = entry.toObject();
        const auto value = object.constFind(QLatin1String("value"));
        const auto mapping = object.constFind(QLatin1String("mapping"));
        if (value != object.constEnd() && mapping != object.constEnd())
            mappings.insert(value->toInt(), mapping->toVariant());
    }
    return mappings;
}

} // namespace

HmiValueMapper* HmiValueMapper::instance()
{
    static auto* const mapper = new HmiValueMapper(QCoreApplication::instance());
    return mapper;
}

QObject* HmiValueMapper::valueMapperProvider(QQmlEngine*, QJSEngine*)
{
    QQmlEngine::setObjectOwnership(instance(), QQmlEngine::CppOwnership);
    return instance();
}

HmiValueMapper::HmiValueMapper(QObject* parent)
    : QObject(parent)
{
}

HmiValueMapper::~HmiValueMapper() = default;

QVariant HmiValueMapper::mappedValue(const QString& valueName, int value) const
{
    const auto mappings = m_valueMappings.first.constFind(valueName);
    if (mappings != m_valueMappings.first.constEnd()) {
        const auto mapping = mappings->constFind(value);
        if (mapping != mappings->constEnd())
            return *mapping;
    }
    const auto byDefault = m_valueMappings.second.constFind(valueName);
    return byDefault == m_valueMappings.second.constEnd() ? QVariant() : *byDefault;
}

void HmiValueMapper::loadValueMapping(const QString& filePath)
{
    m_valueMappings = ValueMappingProcessor::parse(filePath);
    qCDebug(coreLog) << "Value mapping configuration:" << m_valueMappings;
}

QPair<QMap<QString, QMap<int, QVariant>>, QMap<QString, QVariant>> ValueMappingProcessor::parse(const QString& filePath)
{
    QPair<QMap<QString, QMap<int, QVariant>>, QMap<QString, QVariant>> result;
    const QJsonArray elements = readConfigurationDocument(filePath);
    for (const QJsonValue& element : elements) {
        const QJsonObject object = element.toObject();
        const auto name = object.constFind(QLatin1String("valueName"));
        if (name == object.constEnd())
            continue;
        const auto byDefault = object.constFind(QLatin1String("default"));
        if (byDefault != object.constEnd())
            result.second.insert(name->toString(), byDefault->toVariant());
        const auto values = object.constFind(QLatin1String("values"));
        if (values != object.constEnd())
            result.first.insert(name->toString(), mappingsOf(*values));
    }
    return result;
}

QJsonArray ValueMappingProcessor::readConfigurationDocument(const QString& filePath)
{
    const JsonFile file = JsonFile::read(filePath);
    switch (file.outcome) {
    case JsonFile::Read:
        break;
    case JsonFile::Missing:
        qCWarning(coreLog) << "Value mapping config file does not exist:" << filePath;
        break;
    case JsonFile::Unreadable:
        qCWarning(coreLog) << "Can't read value mapping config file:" << filePath;
        break;
    case JsonFile::Malformed:
        qCWarning(coreLog) << "Value mapping config file parse error:" << file.parseError;
        break;
    }
    return file.document.array();
}

} // namespace HmiCore
