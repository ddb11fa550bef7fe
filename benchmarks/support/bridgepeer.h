// SPDX-License-Identifier: MIT
#pragma once

#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/BridgeEndpoint>
#include <AL2HMIBridge/MessageReceivePriorityQueueThread>
#include <AL2HMIBridge/MessageReceiveThread>

#include <QByteArray>
#include <QCoreApplication>

#include <benchmark/benchmark.h>

#include <array>
#include <cstring>
#include <sys/socket.h>
#include <thread>
#include <unistd.h>

constexpr char keyLine[] = "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,0]}\n";

inline void sendAll(int socket, const QByteArray& bytes)
{
    for (qint64 sent = 0; sent < bytes.size();) {
        const auto count = ::send(socket, bytes.constData() + sent, size_t(bytes.size() - sent), MSG_NOSIGNAL);
        if (count <= 0)
            return;
        sent += count;
    }
}

inline void sendKeyLine(int socket)
{
    sendAll(socket, QByteArray::fromRawData(keyLine, sizeof keyLine - 1));
}

/// The bridge with its peers' ends of the connections. It lives to the end of the process, since its threads do.
class BridgePeer
{
public:
    static BridgePeer& instance()
    {
        static auto* const peer = new BridgePeer;
        return *peer;
    }

    int messages() const { return m_pairs[0][1]; }
    int priority() const { return m_pairs[1][1]; }

    /// Reads what the bridge has sent so far on the messages channel.
    void skipSent() const
    {
        char buffer[4096];
        while (::recv(messages(), buffer, sizeof buffer, MSG_DONTWAIT) > 0) {
        }
    }

private:
    BridgePeer()
    {
        using AL2HMIBridge::BridgeConnection;
        using AL2HMIBridge::BridgeEndpoint;
        for (auto& pair : m_pairs)
            if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, pair.data()) != 0)
                qFatal("no sockets");
        BridgeEndpoint::setConnector(
            [this](BridgeEndpoint::Channel channel) { return ::dup(m_pairs[size_t(channel)][0]); });
        AL2HMIBridge::MessageReceiveThread::createInstance(&m_owner)->begin();
        AL2HMIBridge::MessageReceivePriorityQueueThread::createInstance(&m_owner)->begin();
        const QByteArray greeting("{\"protocol\":1,\"peer\":\"application-layer\"}\n");
        sendAll(messages(), greeting + "{\"snapshot\":\"complete\"}\n");
        sendAll(priority(), greeting);
        const BridgeConnection* const connection = BridgeConnection::instance();
        while (!connection->synchronised() || !connection->channelConnected(BridgeEndpoint::Priority))
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }

    std::array<std::array<int, 2>, 2> m_pairs;
    QObject m_owner;
};

/// A line to another thread and back over a bare socket pair.
inline void bareRoundTrip(benchmark::State& state)
{
    int pair[2];
    if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, pair) != 0)
        return state.SkipWithError("no sockets");
    std::thread echo([socket = pair[1]] {
        char buffer[256];
        for (ssize_t count; (count = ::recv(socket, buffer, sizeof buffer, 0)) > 0;)
            if (::send(socket, buffer, size_t(count), MSG_NOSIGNAL) != count)
                return;
    });
    char buffer[256];
    for (auto _ : state) {
        sendKeyLine(pair[0]);
        benchmark::DoNotOptimize(::recv(pair[0], buffer, sizeof buffer, 0));
    }
    ::shutdown(pair[0], SHUT_RDWR);
    echo.join();
    ::close(pair[0]);
    ::close(pair[1]);
}
