// SPDX-License-Identifier: MIT
#include "outbox.h"

#include "bridgelimits.h"

#include <algorithm>
#include <cerrno>
#include <sys/socket.h>
#include <utility>

namespace AL2HMIBridge {

namespace {
const char greeting[] = "{\"protocol\":1,\"peer\":\"hmi\"}\n";
static_assert(protocolVersion == 1, "the greeting names the version");
} // namespace

Outbox& Outbox::of(BridgeEndpoint::Channel channel)
{
    static Outbox outboxes[3];
    return outboxes[channel];
}

Outbox::Result Outbox::send(const QByteArray& line)
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    if (!m_ready || m_broken)
        return NoPeer;
    if (m_waiting.size() + line.size() > maximumOutgoing)
        return Full;
    const bool first = m_waiting.isEmpty();
    m_waiting.append(line);
    if (first)
        write(m_waiting.constData(), int(m_waiting.size()));
    if (m_broken) {
        m_waiting.clear(); // told by what is returned, and not once more at the end
        m_waker.wake();
        return NoPeer;
    }
    if (first && !m_waiting.isEmpty())
        m_waker.wake();
    return Sent;
}

bool Outbox::open(FileDescriptor socket)
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    if (m_socket.isValid())
        return false;
    m_socket = std::move(socket);
    m_ready = m_broken = false;
    m_waiting = greeting;
    write(m_waiting.constData(), int(m_waiting.size()));
    return true;
}

void Outbox::setReady()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    m_ready = true;
}

int Outbox::close()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    const int lost = m_ready ? int(std::count(m_waiting.cbegin(), m_waiting.cend(), '\n')) : 0;
    m_ready = false;
    m_waiting.clear();
    const FileDescriptor closed = std::move(m_socket);
    return lost;
}

void Outbox::flush()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    write(m_waiting.constData(), int(m_waiting.size()));
}

void Outbox::write(const char* data, int size)
{
    int sent = 0;
    while (sent < size && !m_broken) {
        const auto count = ::send(m_socket.get(), data + sent, size_t(size - sent), MSG_NOSIGNAL | MSG_DONTWAIT);
        if (count > 0)
            sent += int(count);
        else if (errno == EAGAIN || errno == EWOULDBLOCK)
            break;
        else if (errno != EINTR)
            m_broken = true; // the receive loop hangs up, once it has read what is left
    }
    m_waiting.remove(0, sent);
}

bool Outbox::wantsToWrite() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return !m_waiting.isEmpty() && !m_broken;
}

bool Outbox::isBroken() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return m_broken;
}

int Outbox::socket() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return m_socket.get();
}

} // namespace AL2HMIBridge
