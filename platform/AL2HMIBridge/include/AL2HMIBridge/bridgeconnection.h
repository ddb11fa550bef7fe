// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"
#include "bridgeendpoint.h"

#include <QObject>

namespace AL2HMIBridge {

struct Message;

/// \brief Whether the application layer is there, for screens and tests. GUI thread only.
class AL2HMIBRIDGE_EXPORT BridgeConnection : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool connected READ connected NOTIFY connectedChanged)
    Q_PROPERTY(bool synchronised READ synchronised NOTIFY synchronisedChanged)

public:
    /// \brief The process's one object, made on the first call as a child of the application object.
    static BridgeConnection* instance();
    ~BridgeConnection() override;

    /// \brief The channel `messages` has a peer that speaks the protocol.
    bool connected() const { return m_connected[BridgeEndpoint::Messages]; }

    /// \brief The state of the sources is the present peer's: its snapshot arrived whole.
    bool synchronised() const { return m_synchronised; }

    /// \brief \a channel has a peer that speaks the protocol.
    bool channelConnected(AL2HMIBridge::BridgeEndpoint::Channel channel) const { return m_connected[channel]; }

Q_SIGNALS:
    void connectedChanged();
    void synchronisedChanged();
    /// \brief A peer of \a channel came or went.
    void channelConnectedChanged(AL2HMIBridge::BridgeEndpoint::Channel channel, bool connected);

private:
    friend void deliver(Message& message);
    friend class ReceiveThread;
    BridgeConnection();
    static void threadEnded(BridgeEndpoint::Channel channel);
    void setConnected(BridgeEndpoint::Channel channel, bool connected);
    void setSynchronised(bool synchronised);

    bool m_connected[3] = {false, false, false};
    bool m_synchronised = false;
};

} // namespace AL2HMIBridge
