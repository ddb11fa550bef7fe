// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"

#include <QObject>
#include <QString>

#include <functional>

namespace AL2HMIBridge {

/// \brief Where the bridge finds the application layer. Set it before the threads begin; all functions are thread-safe.
class AL2HMIBRIDGE_EXPORT BridgeEndpoint
{
    Q_GADGET

public:
    /// \brief The three connections, one per receive thread.
    enum Channel : int {
        Messages = 0, ///< state and calls
        Priority = 1, ///< keys and key combinations
        Touch = 2,    ///< the layer behind the HMI: touches and calls for it
    };
    Q_ENUM(Channel)

    /// \brief Gives a connected stream socket for a channel, which the bridge then owns, or -1 when nobody is there.
    ///
    /// Called in the receive threads, for each attempt to connect; it must not block.
    using Connector = std::function<int(Channel)>;

    /// \brief Name of a channel: its socket's file name and its name in messages and recordings.
    static QString channelName(Channel channel);

    /// \brief The directory of the sockets. Ours only (owner and mode 0700) or nothing is connected.
    ///
    /// `$HMI_BRIDGE_DIR`, else `$XDG_RUNTIME_DIR/hmi-bridge`, else a directory of the user below the one for temporary
    /// files, until setDirectory() names another.
    static QString directory();

    /// \brief Connects to sockets in \a directory from the next attempt on; an empty text restores the default.
    static void setDirectory(const QString& directory);

    /// \brief Connects through \a connector instead of a directory from the next attempt on; an empty function ends that.
    static void setConnector(Connector connector);

    /// \brief What setConnector() was given last; empty by default.
    static Connector connector();
};

} // namespace AL2HMIBridge
