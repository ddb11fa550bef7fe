// SPDX-License-Identifier: MIT
#include "linefile.h"

#include <QFileInfo>

namespace HmiVehicle {

QString openLines(QFile& file, qint64 maximumSize)
{
    const QFileInfo info(file.fileName());
    if (!info.exists())
        return file.fileName() + QStringLiteral(": there is no such file");
    if (!info.isFile())
        return file.fileName() + QStringLiteral(": not a regular file");
    if (info.size() > maximumSize)
        return file.fileName() + QStringLiteral(": too large");
    if (!file.open(QIODevice::ReadOnly))
        return file.fileName() + QStringLiteral(": ") + file.errorString();
    return QString();
}

} // namespace HmiVehicle
