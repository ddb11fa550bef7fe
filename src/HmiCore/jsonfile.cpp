// SPDX-License-Identifier: MIT
#include "jsonfile.h"

#include <QFile>
#include <QFileInfo>

namespace HmiCore {

JsonFile JsonFile::read(const QString& path)
{
    JsonFile result;
    const QFileInfo info(path);
    if (!info.exists())
        return result;
    result.outcome = Unreadable;
    QFile file(path);
    if (!info.isFile() || info.size() > maximumSize || !file.open(QIODevice::ReadOnly))
        return result;
    const QByteArray content = file.readAll();
    if (file.error() != QFileDevice::NoError)
        return result;

    QJsonParseError error;
    result.document = QJsonDocument::fromJson(content, &error);
    result.outcome = error.error == QJsonParseError::NoError ? Read : Malformed;
    if (result.outcome == Malformed)
        result.parseError = error.errorString();
    return result;
}

} // namespace HmiCore
