// SPDX-License-Identifier: MIT
#include "peers.h"

namespace HmiVehicle {

namespace {

constexpr int maximumControlLine = 64 * 1024;

QByteArray greeting(const char* peer)
{
    return QByteArrayLiteral("{\"protocol\":1,\"peer\":\"") + peer + "\"}";
}

QByteArray otherOrder(const char* peer)
{
    return QByteArrayLiteral("{\"peer\":\"") + peer + "\",\"protocol\":1}";
}

} // namespace

Peer hmiPeer(Channel channel)
{
    return {QStringLiteral("HMI on ") + channelName(channel),
            greetingLine(),
            {greeting("hmi"), otherOrder("hmi")},
            QStringLiteral("an HMI of protocol 1"),
            maximumLine};
}

Peer controlPeer()
{
    return {QStringLiteral("Control"),
            greeting("vehicle") + '\n',
            {greeting("control"), otherOrder("control")},
            QStringLiteral("a control of protocol 1"),
            maximumControlLine};
}

Peer vehiclePeer()
{
    return {QStringLiteral("Vehicle"),
            greeting("control") + '\n',
            {greeting("vehicle"), otherOrder("vehicle")},
            QStringLiteral("a vehicle of protocol 1"),
            maximumLine};
}

} // namespace HmiVehicle
