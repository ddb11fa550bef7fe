// SPDX-License-Identifier: MIT
#include "jsonfile.h"

#include "appsettings.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>

namespace HmiGuiFramework {

namespace {
constexpr qint64 sizeLimit = 1024 * 1024;

JsonFile failure(const QString& error)
{
    return {QJsonObject(), error};
}
} // namespace

QString resolvedPath(const QString& path)
{
    if (path.startsWith(QLatin1String("qrc:/")))
        return path.mid(3);
    if (path.startsWith(QLatin1Char(':')) || QDir::isAbsolutePath(path))
        return path;
    return AppSettings::mainFolderPath + path;
}

JsonFile JsonFile::read(const QString& path)
{
    const QFileInfo info(path);
    if (!info.exists())
        return failure(QStringLiteral("the file does not exist"));
    if (!info.isFile())
        return failure(QStringLiteral("it is not a regular file"));
    if (info.size() > sizeLimit)
        return failure(QStringLiteral("it is larger than 1 MiB"));
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return failure(file.errorString());
    const QByteArray text = file.readAll();
    QJsonParseError parsed;
    const QJsonDocument document = QJsonDocument::fromJson(text, &parsed);
    if (parsed.error != QJsonParseError::NoError) {
        const int line = 1 + int(text.left(parsed.offset).count('\n'));
        return failure(QStringLiteral("line %1: %2").arg(line).arg(parsed.errorString()));
    }
    if (!document.isObject())
        return failure(QStringLiteral("the top level is not an object"));
    return {document.object(), QString()};
}

} // namespace HmiGuiFramework
