// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonDocument>
#include <QString>

namespace HmiCore {

/// A configuration file as read from disk, or why it could not be.
///
/// Only regular files are opened, so that a pipe or a device never makes the HMI wait, and none above maximumSize.
struct JsonFile
{
    enum Outcome { Read, Missing, Unreadable, Malformed };

    static constexpr qint64 maximumSize = 16 * 1024 * 1024; ///< bytes

    static JsonFile read(const QString& path);

    Outcome outcome = Missing;
    QJsonDocument document; ///< empty unless Read
    QString parseError;     ///< what the parser says, when Malformed
};

} // namespace HmiCore
