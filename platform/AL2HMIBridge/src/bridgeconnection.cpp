// SPDX-License-Identifier: MIT
#include "bridgeconnection.h"

#include <QCoreApplication>
#include <QPointer>

namespace AL2HMIBridge {

BridgeConnection::BridgeConnection()
    : QObject(QCoreApplication::instance())
{
}

BridgeConnection::~BridgeConnection() = default;

BridgeConnection* BridgeConnection::instance()
{
    static QPointer<BridgeConnection> connection;
    if (!connection)
        connection = new BridgeConnection;
    return connection;
}

void BridgeConnection::setConnected(BridgeEndpoint::Channel channel, bool connected)
{
    if (m_connected[channel] == connected)
        return;
    m_connected[channel] = connected;
    if (channel == BridgeEndpoint::Messages)
        setSynchronised(false);
    Q_EMIT channelConnectedChanged(channel, connected);
    if (channel == BridgeEndpoint::Messages)
        Q_EMIT connectedChanged();
}

void BridgeConnection::setSynchronised(bool synchronised)
{
    if (m_synchronised == synchronised)
        return;
    m_synchronised = synchronised;
    Q_EMIT synchronisedChanged();
}

} // namespace AL2HMIBridge
