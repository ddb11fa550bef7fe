// SPDX-License-Identifier: MIT
#include "HmiVehicle/wire.h"

#include <QJsonDocument>

namespace HmiVehicle {

namespace {
QByteArray encode(const QJsonObject& line)
{
    return QJsonDocument(line).toJson(QJsonDocument::Compact) + '\n';
}
} // namespace

QString channelName(Channel channel)
{
    switch (channel) {
    case Channel::Messages:
        return QStringLiteral("messages");
    case Channel::Priority:
        return QStringLiteral("priority");
    case Channel::Touch:
        return QStringLiteral("touch");
    }
    return QString();
}

bool channelFromName(const QString& name, Channel* channel)
{
    for (const Channel known : allChannels) {
        if (channelName(known) != name)
            continue;
        *channel = known;
        return true;
    }
    return false;
}

QByteArray greetingLine()
{
    return QByteArrayLiteral("{\"protocol\":1,\"peer\":\"application-layer\"}\n");
}

QByteArray snapshotEndLine()
{
    return QByteArrayLiteral("{\"snapshot\":\"complete\"}\n");
}

QByteArray stateLine(const QString& source, const QJsonObject& state)
{
    return encode({{QStringLiteral("source"), source}, {QStringLiteral("state"), state}});
}

QByteArray eventLine(const QString& source, const QString& event, const QJsonArray& arguments)
{
    return encode(
        {{QStringLiteral("source"), source}, {QStringLiteral("event"), event}, {QStringLiteral("args"), arguments}});
}

} // namespace HmiVehicle
