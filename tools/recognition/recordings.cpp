// SPDX-License-Identifier: MIT
#include "recordings.h"

#include <QFile>
#include <QPointF>
#include <QStringList>

namespace Recordings {

namespace {

const QString separator = QStringLiteral(" | ");

bool isComment(const QString& line)
{
    return line.isEmpty() || (line.startsWith(QLatin1String("# ")) && !line.startsWith(QLatin1String("# |")));
}

bool readWritten(const QStringList& fields, Recording& recording)
{
    recording.meant = fields.constFirst();
    const QStringList strokes = fields.mid(1);
    for (const QString& points : strokes) {
        const QVariant found = stroke(points);
        if (!found.isValid())
            return false;
        recording.input.append(found);
    }
    return !recording.input.isEmpty();
}

bool readTyped(const QStringList& fields, Recording& recording)
{
    if (fields.size() != 3)
        return false;
    for (const QChar key : fields.at(0))
        recording.input.append(QString(key));
    recording.meant = fields.at(1);
    recording.among = fields.at(2).toInt();
    return !recording.input.isEmpty() && recording.among > 0;
}

template <typename Read>
QList<Recording> all(const QString& name, Read read, QString* error)
{
    QFile file(name);
    if (!file.open(QIODevice::ReadOnly)) {
        *error = QStringLiteral("%1: %2").arg(name, file.errorString());
        return {};
    }
    QList<Recording> found;
    for (int number = 1; !file.atEnd(); ++number) {
        const QString line = QString::fromUtf8(file.readLine()).trimmed();
        if (isComment(line))
            continue;
        Recording recording;
        const QStringList fields = line.split(separator);
        if (fields.constFirst().isEmpty() || !read(fields, recording)) {
            *error = QStringLiteral("%1:%2: not understood: %3").arg(name).arg(number).arg(line);
            return {};
        }
        found.append(recording);
    }
    return found;
}

} // namespace

QVariant stroke(const QString& points)
{
    QVariantList found;
    const QStringList pairs = points.split(QLatin1Char(' '));
    for (const QString& pair : pairs) {
        bool isX = false;
        bool isY = false;
        const double x = pair.section(QLatin1Char(','), 0, 0).toDouble(&isX);
        const double y = pair.section(QLatin1Char(','), 1).toDouble(&isY);
        if (!isX || !isY)
            return QVariant();
        found.append(QPointF(x, y));
    }
    return found;
}

QList<Recording> written(const QString& file, QString* error)
{
    return all(file, readWritten, error);
}

QList<Recording> typed(const QString& file, QString* error)
{
    return all(file, readTyped, error);
}

} // namespace Recordings
