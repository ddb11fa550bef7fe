// SPDX-License-Identifier: MIT
#include "callsender.h"

#include "bridgelog.h"
#include "bridgelimits.h"
#include "outbox.h"
#include "tap.h"

#include <QJsonDocument>
#include <QJsonObject>

#include <utility>

namespace AL2HMIBridge {

namespace {

CallReceiver& diversion()
{
    static CallReceiver receiver;
    return receiver;
}

QByteArray encode(const QString& source, const QString& call, const QJsonArray& arguments)
{
    const QJsonObject line{{QStringLiteral("source"), source},
                           {QStringLiteral("call"), call},
                           {QStringLiteral("args"), arguments}};
    return QJsonDocument(line).toJson(QJsonDocument::Compact) + '\n';
}

const char* reasonOf(Outbox::Result result)
{
    switch (result) {
    case Outbox::Sent:
        return nullptr;
    case Outbox::NoPeer:
        return "no peer is connected";
    case Outbox::Full:
        return "too much waits to be sent";
    }
    return nullptr;
}

} // namespace

bool sendCall(BridgeEndpoint::Channel channel, const QString& source, const QString& call, const QJsonArray& arguments)
{
    if (diversion()) {
        diversion()(source, call, arguments);
        return true;
    }
    const QByteArray line = encode(source, call, arguments);
    const char* reason = "it is longer than a line may be";
    if (line.size() <= maximumLine)
        reason = reasonOf(Outbox::of(channel).send(line));
    if (!reason) {
        tapLine(channel, Direction::Out, line);
        return true;
    }
    qCWarning(bridgeLog).noquote() << "Call dropped:" << shown(source) + QLatin1Char('.') + shown(call) << "-"
                                   << reason;
    return false;
}

void divertCalls(CallReceiver receiver)
{
    diversion() = std::move(receiver);
}

} // namespace AL2HMIBridge
