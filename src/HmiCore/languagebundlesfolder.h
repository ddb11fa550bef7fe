// SPDX-License-Identifier: MIT
#pragma once

#include <HmiGuiFramework/AppSettings>

#include <QDir>
#include <QString>

namespace HmiCore {

/// Where bundles and their properties are configured; the main folder's path ends with its separator.
inline QString languageBundlesFolder()
{
    return QDir(HmiGuiFramework::AppSettings::mainFolderPath + QLatin1String("languageBundles/")).absolutePath();
}

inline QString languageBundlesPath(const QString& fileName, const QString& directory)
{
    return QDir::toNativeSeparators(directory + QLatin1Char('/') + fileName);
}

} // namespace HmiCore
