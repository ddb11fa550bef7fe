// SPDX-License-Identifier: MIT
#pragma once

#include "bridgeendpoint.h"
#include "filedescriptor.h"

namespace AL2HMIBridge {

/// Makes connections to the application layer and refuses those that are not safe.
class Dialer
{
public:
    explicit Dialer(BridgeEndpoint::Channel channel);

    /// A connected socket, or none. Does not wait. Why a peer is refused is said once, until the reason changes.
    FileDescriptor dial();

private:
    FileDescriptor connectInDirectory(QString* problem) const;

    BridgeEndpoint::Channel m_channel;
    QString m_reported;
};

} // namespace AL2HMIBridge
