// SPDX-License-Identifier: MIT
#include "connection.h"

#include <QLoggingCategory>
#include <QPointer>

#include <cerrno>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>
#include <utility>

namespace HmiVehicle {

Q_LOGGING_CATEGORY(vehicleLog, "vehicle", QtInfoMsg)

namespace {
constexpr int chunk = 64 * 1024;
constexpr int maximumWaiting = 4 * 1024 * 1024; ///< bytes that the peer has not read; more means that it stalls
constexpr int maximumComplaints = 20;
constexpr int greetingTime = 2000;
constexpr int stallTime = 1000; ///< without reading anything
} // namespace

Connection::Connection(int socket, Peer peer, QObject* parent)
    : QObject(parent)
    , m_socket(socket)
    , m_peer(std::move(peer))
    , m_readable(socket, QSocketNotifier::Read)
    , m_writable(socket, QSocketNotifier::Write)
{
    m_writable.setEnabled(false);
    connect(&m_readable, &QSocketNotifier::activated, this, &Connection::readSome);
    connect(&m_writable, &QSocketNotifier::activated, this, &Connection::flush);
}

Connection::~Connection()
{
    m_readable.setEnabled(false);
    m_writable.setEnabled(false);
    ::close(m_socket);
}

void Connection::start()
{
    m_greetingTimer = startTimer(greetingTime);
    send(m_peer.ownGreeting);
}

void Connection::send(const QByteArray& lines)
{
    if (!m_open)
        return;
    const bool wasWaiting = waiting() > 0; // then it is said when more can be sent
    m_waiting += lines;
    if (!wasWaiting)
        flush();
    if (waiting() > maximumWaiting && !drain())
        hangUp(QStringLiteral("it does not read"));
}

/// Waits until there is room again. False when the peer reads nothing for a while.
bool Connection::drain()
{
    while (m_open && waiting() > maximumWaiting / 2) {
        pollfd descriptor{m_socket, POLLOUT, 0};
        const int count = ::poll(&descriptor, 1, stallTime);
        if (count == 0)
            return false;
        flush();
    }
    return m_open;
}

void Connection::flush()
{
    while (waiting() > 0) {
        const auto count =
            ::send(m_socket, m_waiting.constData() + m_sent, size_t(waiting()), MSG_NOSIGNAL | MSG_DONTWAIT);
        if (count > 0)
            m_sent += int(count);
        else if (errno == EAGAIN || errno == EWOULDBLOCK)
            break;
        else if (errno != EINTR)
            return hangUp();
    }
    if (m_sent * 2 >= m_waiting.size()) // seldom, because it moves what is left
        m_waiting.remove(0, std::exchange(m_sent, 0));
    m_writable.setEnabled(waiting() > 0);
}

void Connection::readSome()
{
    char buffer[chunk];
    const auto count = ::recv(m_socket, buffer, sizeof buffer, MSG_DONTWAIT);
    if (count < 0 && (errno == EAGAIN || errno == EWOULDBLOCK || errno == EINTR))
        return;
    if (count <= 0)
        return hangUp();
    m_partial.append(buffer, int(count));
    const QPointer<Connection> self(this);
    int begin = 0;
    for (int end; (end = int(m_partial.indexOf('\n', begin))) >= 0; begin = end + 1) {
        if (end - begin >= m_peer.maximumLine)
            return hangUp(QStringLiteral("its line is too long"));
        takeLine(m_partial.mid(begin, end - begin));
        if (!self || !m_open)
            return;
    }
    m_partial.remove(0, begin);
    if (m_partial.size() >= m_peer.maximumLine)
        hangUp(QStringLiteral("its line is too long"));
}

void Connection::takeLine(const QByteArray& line)
{
    if (m_greeted) {
        Q_EMIT lineReceived(line);
    } else if (m_peer.greetings.contains(line)) {
        m_greeted = true;
        killTimer(m_greetingTimer);
        Q_EMIT greetedByPeer();
    } else {
        hangUp(QStringLiteral("it does not greet as ") + m_peer.protocol);
    }
}

void Connection::timerEvent(QTimerEvent*)
{
    if (!m_greeted)
        hangUp(QStringLiteral("it does not greet"));
}

void Connection::complain(const QString& problem)
{
    if (m_complaints++ < maximumComplaints)
        qCWarning(vehicleLog).noquote() << "Line refused:" << m_peer.name + QLatin1Char(':') << problem;
}

void Connection::hangUp(const QString& reason)
{
    if (!m_open)
        return;
    m_open = false;
    m_readable.setEnabled(false);
    m_writable.setEnabled(false);
    ::shutdown(m_socket, SHUT_RDWR);
    if (!reason.isEmpty())
        qCWarning(vehicleLog).noquote() << m_peer.name << "left:" << reason;
    Q_EMIT closed();
    deleteLater();
}

} // namespace HmiVehicle
