// SPDX-License-Identifier: MIT
#pragma once

#include "bridgeendpoint.h"
#include "filedescriptor.h"
#include "waker.h"

#include <QByteArray>

#include <mutex>

namespace AL2HMIBridge {

/// The outgoing side of a channel: one per channel for the life of the process. Any thread; nothing here waits for a peer.
class Outbox
{
public:
    enum Result { Sent, NoPeer, Full };

    static Outbox& of(BridgeEndpoint::Channel channel);

    /// Sends a line, or keeps the part of it that the socket does not take; until setReady() there is no peer.
    Result send(const QByteArray& line);

    /// The receive thread's: owns \a socket until close() and greets the peer. False when another one is open.
    bool open(FileDescriptor socket);
    void setReady();
    /// Forgets what was not sent; the number of whole or cut lines that were lost.
    int close();
    /// Sends what waits, as far as the socket takes it.
    void flush();
    bool wantsToWrite() const;
    /// The peer takes nothing any more, though it may still send.
    bool isBroken() const;

    int socket() const;
    Waker& waker() { return m_waker; }

private:
    void write(const char* data, int size);

    mutable std::mutex m_mutex;
    Waker m_waker;
    FileDescriptor m_socket;
    QByteArray m_waiting;
    bool m_ready = false;
    bool m_broken = false;
};

} // namespace AL2HMIBridge
