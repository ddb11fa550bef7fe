// SPDX-License-Identifier: MIT
#include "recording.h"

#include "expectation.h"
#include "linefile.h"

#include <QJsonDocument>
#include <QJsonObject>

namespace HmiVehicle {

namespace {

constexpr qint64 maximumSize = 256 * 1024 * 1024;

QByteArray encoded(const QJsonObject& line)
{
    return QJsonDocument(line).toJson(QJsonDocument::Compact);
}

bool isFromDeveloper(const QJsonObject& line)
{
    return line.value(QLatin1String("source")).toString() == QLatin1String("DeveloperSource");
}

Recording::Kind kindOf(const QJsonObject& object, const QJsonObject& line, bool toHmi)
{
    if (object.contains(QLatin1String("dropped")))
        return Recording::Lost;
    if (!toHmi)
        return Recording::FromHmi;
    if (line.contains(QLatin1String("protocol")))
        return Recording::Greeting;
    return line.value(QLatin1String("event")).toString() == QLatin1String("fence") ? Recording::Fence
                                                                                   : Recording::ToHmi;
}

} // namespace

bool Recording::load(const QString& fileName)
{
    m_entries.clear();
    QFile file(fileName);
    m_error = openLines(file, maximumSize);
    for (int number = 1; m_error.isEmpty() && !file.atEnd(); ++number) {
        const QByteArray line = file.readLine().trimmed();
        const QString problem = line.isEmpty() ? QString() : add(line, number);
        if (!problem.isEmpty())
            m_error = QStringLiteral("%1:%2: %3").arg(fileName).arg(number).arg(problem);
    }
    if (m_error.isEmpty() && m_entries.empty())
        m_error = fileName + QStringLiteral(": nothing is recorded in it");
    return m_error.isEmpty();
}

QString Recording::add(const QByteArray& bytes, int number)
{
    const QJsonObject object = QJsonDocument::fromJson(bytes).object();
    const QJsonValue time = object.value(QLatin1String("t"));
    const QString direction = object.value(QLatin1String("direction")).toString();
    const bool toHmi = direction == QLatin1String("in");
    const QJsonObject line = object.value(QLatin1String("line")).toObject();
    const QJsonValue text = object.value(QLatin1String("text"));
    Channel channel{};
    if (!time.isDouble() || !channelFromName(object.value(QLatin1String("channel")).toString(), &channel)
        || (!toHmi && direction != QLatin1String("out"))
        || (line.isEmpty() && !text.isString() && !object.contains(QLatin1String("dropped"))))
        return QStringLiteral("not a line of a recording");
    if (!m_entries.empty() && time.toDouble() < m_entries.back().time)
        return QStringLiteral("time goes back");
    const Kind kind = kindOf(object, line, toHmi);
    QByteArray content = text.isString() ? text.toString().toUtf8() : encoded(line);
    if (kind == FromHmi)
        content = comparable(content);
    m_entries.push_back({kind, time.toDouble(), channel, content, number});
    return QString();
}

QByteArray Recording::comparable(const QByteArray& line)
{
    const QJsonObject object = QJsonDocument::fromJson(line).object();
    if (isFromDeveloper(object)) // talk about the HMI, nothing that it wants
        return QByteArray();
    return object.isEmpty() ? line : encoded(object);
}

QString Recording::describe(const QByteArray& line)
{
    const QJsonObject object = QJsonDocument::fromJson(line).object();
    const QString call = object.value(QLatin1String("call")).toString();
    if (call.isEmpty())
        return QString::fromUtf8(line.left(200));
    return callText(object.value(QLatin1String("source")).toString(), call,
                    object.value(QLatin1String("args")).toArray());
}

} // namespace HmiVehicle
