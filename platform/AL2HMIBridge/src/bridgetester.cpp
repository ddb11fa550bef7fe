// SPDX-License-Identifier: MIT
#include "bridgetester.h"

#include "callsender.h"
#include "channelreader.h"
#include "decoder.h"
#include "refusals.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <utility>

namespace AL2HMIBridge {

namespace {

QList<BridgeTester::Call>& record()
{
    static QList<BridgeTester::Call> calls;
    return calls;
}

QVariant plain(const QJsonValue& value)
{
    return value.isDouble() ? QVariant(value.toInt()) : value.toVariant();
}

BridgeEndpoint::Channel channelOf(const QByteArray& line)
{
    const QJsonObject object = QJsonDocument::fromJson(line).object();
    const SourceInfo* const source = SourceTable::find(object.value(QLatin1String("source")).toString());
    return source ? source->channel : BridgeEndpoint::Messages;
}

bool sendObject(const QJsonObject& line)
{
    return BridgeTester::sendLine(QJsonDocument(line).toJson(QJsonDocument::Compact));
}

} // namespace

QString BridgeTester::Call::text() const
{
    QStringList texts;
    for (const QVariant& argument : arguments) {
        const bool isText = argument.userType() == QMetaType::QString;
        texts.append(isText ? QLatin1Char('"') + argument.toString() + QLatin1Char('"') : argument.toString());
    }
    return QStringLiteral("%1.%2(%3)").arg(source, name, texts.join(QStringLiteral(", ")));
}

BridgeTester::Peer::Peer(BridgeEndpoint::Channel channel)
    : m_channel(channel)
    , m_reader(std::make_unique<ChannelReader>(channel))
{
}

BridgeTester::Peer::~Peer()
{
    if (!m_reader)
        return;
    m_reader->finish();
    disconnect();
}

bool BridgeTester::Peer::send(const QByteArray& bytes)
{
    if (!m_reader)
        return false;
    std::vector<Message> messages;
    const bool spoken = m_reader->feed(bytes.constData(), int(bytes.size()), &messages);
    for (Message& message : messages)
        deliver(message);
    if (!spoken)
        disconnect();
    return spoken;
}

void BridgeTester::Peer::disconnect()
{
    const bool announced = m_reader->greeted();
    m_reader.reset();
    if (!announced)
        return;
    Message message;
    message.kind = Message::Disconnected;
    message.channel = m_channel;
    deliver(message);
}

BridgeTester::BridgeTester()
{
    record().clear();
    resetState();
    divertCalls([](const QString& source, const QString& call, const QJsonArray& arguments) {
        QVariantList values;
        for (const auto& value : arguments)
            values.append(plain(value));
        record().append({source, call, values});
    });
}

BridgeTester::~BridgeTester()
{
    divertCalls({});
    record().clear();
    resetState();
}

bool BridgeTester::setState(const QString& source, const QVariantMap& state)
{
    return sendObject(
        {{QStringLiteral("source"), source}, {QStringLiteral("state"), QJsonObject::fromVariantMap(state)}});
}

bool BridgeTester::setState(const char* source, std::initializer_list<std::pair<const char*, QVariant>> state)
{
    QVariantMap map;
    for (const auto& entry : state)
        map.insert(QString::fromUtf8(entry.first), entry.second);
    return setState(QString::fromUtf8(source), map);
}

bool BridgeTester::sendEvent(const QString& source, const QString& event, const QVariantList& arguments)
{
    return sendObject({{QStringLiteral("source"), source},
                       {QStringLiteral("event"), event},
                       {QStringLiteral("args"), QJsonArray::fromVariantList(arguments)}});
}

bool BridgeTester::sendEvent(const char* source, const char* event, const QVariantList& arguments)
{
    return sendEvent(QString::fromUtf8(source), QString::fromUtf8(event), arguments);
}

bool BridgeTester::sendLine(const QByteArray& line)
{
    Message message;
    const BridgeEndpoint::Channel channel = channelOf(line);
    const QString problem = decode(line, channel, &message);
    if (!problem.isEmpty()) {
        Refusals(channel).report(problem);
        return false;
    }
    deliver(message);
    return true;
}

void BridgeTester::resetState()
{
    resetSources();
}

QList<BridgeTester::Call> BridgeTester::calls()
{
    return record();
}

QStringList BridgeTester::takeCalls()
{
    QStringList texts;
    const auto calls = std::exchange(record(), {});
    for (const Call& call : calls)
        texts.append(call.text());
    return texts;
}

} // namespace AL2HMIBridge
