// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"
#include "bridgeendpoint.h"

#include <QList>
#include <QString>
#include <QStringList>
#include <QVariantList>
#include <QVariantMap>

#include <initializer_list>
#include <memory>
#include <utility>

namespace AL2HMIBridge {

class ChannelReader;

/// \brief Plays the application layer in a test, without threads and sockets. GUI thread only; one at a time.
///
/// While one lives, calls are recorded instead of sent. State and events go through the decoder that messages go
/// through, and are with the sources when the function returns. Construction and destruction put every source at its
/// defaults and empty the record. All functions are static, because there is one bridge in a process.
class AL2HMIBRIDGE_EXPORT BridgeTester
{
public:
    /// \brief A call that left.
    struct Call
    {
        QString source;         ///< class name of the source
        QString name;           ///< of the call
        QVariantList arguments; ///< enumerations as numbers; whole numbers as int

        /// \brief Such as `GlobalSource.setAudioSource(12, -1)` or `FMTunerSource.tune("98.5", "-1")`.
        QString text() const;
    };

    /// \brief The application layer at the other end of one channel, from connecting to hanging up.
    ///
    /// What it sends goes the way of what arrives on a socket: greeting, snapshot, lines in whatever pieces. A new one is what
    /// a restarted application layer is.
    class AL2HMIBRIDGE_EXPORT Peer
    {
    public:
        /// \brief Connects.
        explicit Peer(BridgeEndpoint::Channel channel);
        /// \brief Hangs up, if the HMI has not.
        ~Peer();
        Peer(const Peer&) = delete;
        Peer& operator=(const Peer&) = delete;

        /// \brief Sends bytes; what they complete is with the sources when it returns. False once the HMI has hung up.
        bool send(const QByteArray& bytes);

    private:
        void disconnect();

        const BridgeEndpoint::Channel m_channel;
        std::unique_ptr<ChannelReader> m_reader;
    };

    BridgeTester();
    ~BridgeTester();
    BridgeTester(const BridgeTester&) = delete;
    BridgeTester& operator=(const BridgeTester&) = delete;

    /// \brief Sets state as one message does: all of it, or, after the usual warning, nothing and false.
    static bool setState(const QString& source, const QVariantMap& state);
    /// \brief As above, written out.
    static bool setState(const char* source, std::initializer_list<std::pair<const char*, QVariant>> state);

    /// \brief Sends an event as a message does; false after the usual warning.
    static bool sendEvent(const QString& source, const QString& event, const QVariantList& arguments = {});
    /// \brief As above, written out.
    static bool sendEvent(const char* source, const char* event, const QVariantList& arguments = {});

    /// \brief Gives a line of the protocol to its channel's reader; false after the usual warning.
    static bool sendLine(const QByteArray& line);

    /// \brief Puts every source at its defaults, as an empty snapshot does.
    static void resetState();

    /// \brief What was called since construction or the last take, oldest first.
    static QList<Call> calls();

    /// \brief The texts of calls(), which are forgotten then.
    static QStringList takeCalls();
};

} // namespace AL2HMIBridge
