// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>

namespace HmiGuiFramework {

/// Where a path of the framework's configuration leads: a resource ("qrc:/…" becomes ":/…"), an absolute path, or one below
/// AppSettings::mainFolderPath.
QString resolvedPath(const QString& path);

/// A JSON document whose top level is an object. With \ref error set, \ref object is empty.
struct JsonFile
{
    /// Reads regular files and resources of at most 1 MiB; anything else is an error that says what is wrong and, for
    /// text that does not parse, in which line.
    static JsonFile read(const QString& path);

    QJsonObject object;
    QString error;
};

} // namespace HmiGuiFramework
