// SPDX-License-Identifier: MIT
#include "connection.h"

#include <QLoggingCategory>
#include <QPointer>

#include <cerrno>
#include <sys/socket.h>
#include <unistd.h>

namespace HmiVehicle {

Q_LOGGING_CATEGORY(vehicleLog, "vehicle", QtInfoMsg)

namespace {
constexpr int chunk = 64 * 1024;
constexpr int maximumWaiting = 4 * 1024 * 1024; ///< bytes that the peer has not read; more means that it stalls
constexpr int maximumComplaints = 20;
constexpr int greetingTime = 2000;
} // namespace

Connection::Connection(int socket, Channel channel, QObject* parent)
    : QObject(parent)
    , m_socket(socket)
    , m_channel(channel)
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
    send(greetingLine());
}

void Connection::send(const QByteArray& lines)
{
    if (!m_open)
        return;
    m_waiting += lines;
    flush();
    if (m_waiting.size() > maximumWaiting)
        hangUp(QStringLiteral("it does not read"));
}

void Connection::flush()
{
    int sent = 0;
    while (sent < m_waiting.size()) {
        const auto count = ::send(m_socket, m_waiting.constData() + sent, size_t(m_waiting.size() - sent),
                                  MSG_NOSIGNAL | MSG_DONTWAIT);
        if (count > 0)
            sent += int(count);
        else if (errno == EAGAIN || errno == EWOULDBLOCK)
            break;
        else if (errno != EINTR)
            return hangUp();
    }
    m_waiting.remove(0, sent);
    m_writable.setEnabled(!m_waiting.isEmpty());
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
        takeLine(m_partial.mid(begin, end - begin));
        if (!self || !m_open)
            return;
    }
    m_partial.remove(0, begin);
    if (m_partial.size() >= maximumLine)
        hangUp(QStringLiteral("its line is too long"));
}

void Connection::takeLine(const QByteArray& line)
{
    if (m_greeted) {
        Q_EMIT lineReceived(line);
    } else if (line == "{\"protocol\":1,\"peer\":\"hmi\"}" || line == "{\"peer\":\"hmi\",\"protocol\":1}") {
        m_greeted = true;
        killTimer(m_greetingTimer);
        Q_EMIT greetedByPeer();
    } else {
        hangUp(QStringLiteral("it does not greet as an HMI of protocol 1"));
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
        qCWarning(vehicleLog).noquote() << "Line refused on" << channelName(m_channel) + QLatin1Char(':') << problem;
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
        qCWarning(vehicleLog).noquote() << "HMI on" << channelName(m_channel) << "left:" << reason;
    Q_EMIT closed();
    deleteLater();
}

} // namespace HmiVehicle
