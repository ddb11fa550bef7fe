// SPDX-License-Identifier: MIT
#include "callsender.h"

#include "bridgelog.h"
#include "bridgelimits.h"
#include "outbox.h"
#include "tap.h"

#include <QJsonDocument>
#include <QStringBuilder>

#include <algorithm>
#include <utility>

namespace AL2HMIBridge {

namespace {

CallReceiver& diversion()
{
    static CallReceiver receiver;
    return receiver;
}

QByteArray encoded(const QJsonArray& values)
{
    return values.isEmpty() ? QByteArrayLiteral("[]") : QJsonDocument(values).toJson(QJsonDocument::Compact);
}

/// Names are plain words nearly always; what is not is left to the JSON writer.
QByteArray encoded(const QString& name)
{
    const bool plain = std::all_of(name.cbegin(), name.cend(),
                                   [](QChar letter) { return letter.unicode() < 128 && letter.isLetterOrNumber(); });
    if (plain)
        return '"' % name.toLatin1() % '"';
    const QByteArray list = encoded(QJsonArray{name});
    return list.mid(1, list.size() - 2);
}

/// The keys stand here and not in an object: building and walking one took most of the time of a call without arguments.
QByteArray encode(const QString& source, const QString& call, const QJsonArray& arguments)
{
    return "{\"args\":" % encoded(arguments) % ",\"call\":" % encoded(call) % ",\"source\":" % encoded(source) % "}\n";
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
