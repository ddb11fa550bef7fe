// SPDX-License-Identifier: MIT
#include "bridgeconnection.h"

#include <QCoreApplication>
#include <QPointer>

namespace AL2HMIBridge {

namespace {
QPointer<BridgeConnection>& present()
{
    static QPointer<BridgeConnection> connection;
    return connection;
}
} // namespace

BridgeConnection::BridgeConnection()
    : QObject(QCoreApplication::instance())
{
}

BridgeConnection::~BridgeConnection() = default;

BridgeConnection* BridgeConnection::instance()
{
    if (!present())
        present() = new BridgeConnection;
    return present();
}

/// May come when the application object is being destroyed: makes nothing new.
void BridgeConnection::threadEnded(BridgeEndpoint::Channel channel)
{
    if (present())
        present()->setConnected(channel, false);
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
