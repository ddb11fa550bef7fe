// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>

/// A JSON object that the head unit or a module ships as a file of its own.
namespace DataFile {

constexpr qint64 maximumSize = 4 * 1024 * 1024; ///< bytes

/// The object in the file, or nothing and \a error, which begins with the file's name. Pipes, devices, folders and files above
/// maximumSize are refused without being opened, so that this neither waits nor fills the memory. Any thread.
QJsonObject read(const QString& fileName, QString* error);

} // namespace DataFile
