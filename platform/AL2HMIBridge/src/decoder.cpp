// SPDX-License-Identifier: MIT
#include "decoder.h"

#include "bridgelog.h"
#include "bridgelimits.h"
#include "valuedecoder.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace AL2HMIBridge {

namespace {

// What is said of a source's line begins with what separates it from the source's name.

const QLatin1String sourceKey("source");
const QLatin1String stateKey("state");
const QLatin1String eventKey("event");
const QLatin1String argumentsKey("args");
const QLatin1String protocolKey("protocol");
const QLatin1String peerKey("peer");
const QLatin1String snapshotKey("snapshot");

QString decodeGreeting(const QJsonObject& line, Message* message)
{
    message->kind = Message::Greeting;
    if (line.value(protocolKey) != QJsonValue(protocolVersion))
        return QStringLiteral("this side speaks protocol version %1 only").arg(protocolVersion);
    if (line.size() != 2 || line.value(peerKey).toString() != QLatin1String("application-layer"))
        return QStringLiteral("the first line must name the peer \"application-layer\"");
    return QString();
}

QString decodeSnapshotEnd(const QJsonObject& line, BridgeEndpoint::Channel channel, Message* message)
{
    message->kind = Message::SnapshotEnd;
    if (channel != BridgeEndpoint::Messages)
        return QStringLiteral("snapshots belong on \"messages\"");
    if (line.size() != 1 || line.value(snapshotKey).toString() != QLatin1String("complete"))
        return QStringLiteral("\"snapshot\" must be \"complete\"");
    return QString();
}

QString decodeState(const QJsonObject& line, Message* message)
{
    message->kind = Message::State;
    const QJsonValue state = line.value(stateKey);
    if (line.size() != 2 || !state.isObject())
        return QStringLiteral(": \"state\" must be an object and stand alone beside the source");
    const QJsonObject values = state.toObject();
    message->fields.reserve(size_t(values.size()));
    for (auto it = values.constBegin(); it != values.constEnd(); ++it) {
        const QString name = it.key();
        const Field* const field = SourceTable::findField(*message->source, name);
        if (!field)
            return QStringLiteral(".%1: no such state").arg(shown(name));
        message->fields.push_back({field, Value()});
        const QString problem = decodeValue(it.value(), field->shape, &message->fields.back().value);
        if (!problem.isEmpty())
            return QStringLiteral(".%1: %2").arg(name, problem);
    }
    return QString();
}

QString decodeArguments(const QJsonArray& values, const Event& event, Message* message)
{
    if (values.size() != event.arguments.count)
        return QStringLiteral(".%1: %2 arguments instead of %3")
            .arg(event.name)
            .arg(values.size())
            .arg(event.arguments.count);
    message->arguments.resize(size_t(values.size()));
    for (int i = 0; i < event.arguments.count; ++i) {
        const Argument& argument = event.arguments.first[i];
        const QString problem = decodeValue(values.at(i), argument.shape, &message->arguments[size_t(i)]);
        if (!problem.isEmpty())
            return QStringLiteral(".%1, %2: %3").arg(event.name, argument.name, problem);
    }
    return QString();
}

QString decodeEvent(const QJsonObject& line, Message* message)
{
    message->kind = Message::Event;
    const QJsonValue event = line.value(eventKey);
    const QJsonValue arguments = line.value(argumentsKey);
    if (line.size() != 3 || !event.isString() || !arguments.isArray())
        return QStringLiteral(": an event must have a name and an array \"args\", and nothing else");
    const QString name = event.toString();
    message->event = SourceTable::findEvent(*message->source, name);
    if (!message->event)
        return QStringLiteral(".%1: no such event").arg(shown(name));
    return decodeArguments(arguments.toArray(), *message->event, message);
}

QString decodeSourceLine(const QJsonObject& line, BridgeEndpoint::Channel channel, Message* message)
{
    const QJsonValue source = line.value(sourceKey);
    if (!source.isString())
        return QStringLiteral("\"source\" must be a text");
    const QString name = source.toString();
    message->source = SourceTable::find(name);
    if (!message->source)
        return QStringLiteral("%1: no such source").arg(shown(name));
    const bool isState = line.contains(stateKey);
    if (!isState && !line.contains(eventKey))
        return QStringLiteral("%1: neither state nor event").arg(name);
    if (message->source->channel != channel)
        return QStringLiteral("%1: belongs on \"%2\"").arg(name, BridgeEndpoint::channelName(message->source->channel));
    const QString problem = isState ? decodeState(line, message) : decodeEvent(line, message);
    return problem.isEmpty() ? QString() : name + problem;
}

} // namespace

QString decode(const QByteArray& line, BridgeEndpoint::Channel channel, Message* message, bool* isJson)
{
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(line, &error);
    const bool isObject = error.error == QJsonParseError::NoError && document.isObject();
    if (isJson)
        *isJson = isObject;
    if (error.error != QJsonParseError::NoError)
        return QStringLiteral("not JSON: %1 at byte %2").arg(error.errorString()).arg(error.offset);
    if (!isObject)
        return QStringLiteral("not a JSON object");
    message->channel = channel;
    message->bytes = int(line.size());
    const QJsonObject object = document.object();
    if (object.contains(protocolKey))
        return decodeGreeting(object, message);
    if (object.contains(snapshotKey))
        return decodeSnapshotEnd(object, channel, message);
    return decodeSourceLine(object, channel, message);
}

} // namespace AL2HMIBridge
