// SPDX-License-Identifier: MIT
#include "pluginlists.h"

#include <QFileInfo>
#include <QSettings>

namespace HmiCore {

PluginLists PluginLists::read(const QString& fileName)
{
    if (!QFileInfo(fileName).isFile()) // reading a pipe of this name would never end
        return {};
    QSettings settings(fileName, QSettings::IniFormat);
    settings.beginGroup(QStringLiteral("Global"));
    return {settings.value(QStringLiteral("whitelist")).toStringList(),
            settings.value(QStringLiteral("blacklist")).toStringList()};
}

} // namespace HmiCore
