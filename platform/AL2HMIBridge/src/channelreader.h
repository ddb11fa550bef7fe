// SPDX-License-Identifier: MIT
#pragma once

#include "message.h"
#include "refusals.h"

#include <QByteArray>

#include <vector>

namespace AL2HMIBridge {

/// One connection's incoming side without the socket: splits bytes into lines, refuses what is wrong, gathers snapshots.
class ChannelReader
{
public:
    explicit ChannelReader(BridgeEndpoint::Channel channel);

    /// Appends to \a messages what the bytes complete. False when the peer does not speak the protocol: hang up.
    bool feed(const char* data, int size, std::vector<Message>* messages);

    /// One whole line without its end. As feed().
    bool feedLine(const QByteArray& line, std::vector<Message>* messages);

    /// The peer hung up: half a line is refused.
    void finish();

    /// The peer's first line arrived and is right.
    bool greeted() const { return m_greeted; }

    /// Goes on in the middle of a connection, after its snapshot.
    void assumeGreeted() { m_greeted = true; }

private:
    void gather(const char* begin, const char* end);
    bool takeGreeting(const Message& message, const QString& problem, std::vector<Message>* messages);
    bool takeMessage(Message&& message, std::vector<Message>* messages);
    bool addToSnapshot(Message&& message);
    void endSnapshot(std::vector<Message>* messages);

    BridgeEndpoint::Channel m_channel;
    Refusals m_refusals;
    QByteArray m_partial;
    std::vector<SourceState> m_snapshot;
    int m_snapshotBytes = 0;
    bool m_skipping = false;
    bool m_greeted = false;
    bool m_gathering = false;
};

} // namespace AL2HMIBridge
