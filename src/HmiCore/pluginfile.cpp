// SPDX-License-Identifier: MIT
#include "pluginfile.h"

#include "elfsections.h"

#include <QDir>
#include <QJsonArray>

namespace HmiCore {

PluginFile::PluginFile(const QDir& directory, const QString& fileName)
    : m_fileName(fileName)
{
    const QString path = directory.absoluteFilePath(fileName);
    if (!hasSoundSections(path))
        return;
    m_loader.setFileName(path);
    m_metaData = m_loader.metaData();
}

bool PluginFile::hasInterfaceId(const char* interfaceId) const
{
    return m_metaData.value(QLatin1String("IID")) == QJsonValue(QLatin1String(interfaceId));
}

bool PluginFile::hasOwnMetaData() const
{
    return m_metaData.contains(QLatin1String("MetaData"));
}

QString PluginFile::name() const
{
    return ownMetaData().value(QLatin1String("Name")).toString();
}

QStringList PluginFile::keys() const
{
    QStringList keys;
    const QJsonArray entries = ownMetaData().value(QLatin1String("Keys")).toArray();
    for (const QJsonValue& entry : entries)
        keys.append(entry.toString());
    return keys;
}

QObject* PluginFile::rootObject()
{
    return m_loader.instance();
}

QJsonObject PluginFile::ownMetaData() const
{
    return m_metaData.value(QLatin1String("MetaData")).toObject();
}

} // namespace HmiCore
