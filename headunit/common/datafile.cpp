// SPDX-License-Identifier: MIT
#include "datafile.h"

#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>

namespace {

QString problemWith(QFile& file)
{
    const QFileInfo info(file);
    if (info.exists() && !info.isFile())
        return QStringLiteral("is no regular file");
    if (info.size() > DataFile::maximumSize)
        return QStringLiteral("has more than %1 bytes").arg(DataFile::maximumSize);
    return file.open(QIODevice::ReadOnly) ? QString() : file.errorString();
}

QJsonObject parse(const QByteArray& content, QString* problem)
{
    QJsonParseError parsing;
    const QJsonDocument document = QJsonDocument::fromJson(content, &parsing);
    if (parsing.error != QJsonParseError::NoError)
        *problem = QStringLiteral("%1 at byte %2").arg(parsing.errorString()).arg(parsing.offset);
    else if (!document.isObject())
        *problem = QStringLiteral("is no object");
    return document.object();
}

} // namespace

QJsonObject DataFile::read(const QString& fileName, QString* error)
{
    QFile file(fileName);
    QString problem = problemWith(file);
    QJsonObject object;
    if (problem.isEmpty())
        object = parse(file.readAll(), &problem);
    *error = problem.isEmpty() ? QString() : fileName + QStringLiteral(": ") + problem;
    return object;
}
