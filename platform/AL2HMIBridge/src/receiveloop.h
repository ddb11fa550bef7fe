// SPDX-License-Identifier: MIT
#pragma once

#include "bridgeendpoint.h"
#include "dialer.h"
#include "inbox.h"
#include "outbox.h"

#include <vector>

struct pollfd;

namespace AL2HMIBridge {

class ChannelReader;

/// What a receive thread does: connects, receives, connects again. It ends only by termination, which wait() allows.
class ReceiveLoop
{
public:
    explicit ReceiveLoop(BridgeEndpoint::Channel channel);

    [[noreturn]] void run();

private:
    /// Every wait of the thread happens here; nowhere else may it be terminated, and nothing is locked here.
    static int wait(pollfd* descriptors, unsigned count, int milliseconds);

    bool serve(FileDescriptor socket);
    bool receive(int socket, ChannelReader& reader);

    BridgeEndpoint::Channel m_channel;
    Outbox& m_outbox;
    Inbox m_inbox;
    Dialer m_dialer;
    std::vector<char> m_buffer;
};

} // namespace AL2HMIBridge
