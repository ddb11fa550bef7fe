// SPDX-License-Identifier: MIT
#include "fakepeer.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QFile>
#include <QTest>
#include <QThread>

#include <cstdio>
#include <cstring>
#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>
#include <utility>

namespace {

const char* const channels[] = {"messages", "priority", "touch"};

/// Lets the GUI thread go on when it is the one that waits.
bool ready(int fd, short events, const QDeadlineTimer& deadline)
{
    pollfd descriptor{fd, events, 0};
    const bool isGuiThread = QThread::currentThread() == QCoreApplication::instance()->thread();
    if (!isGuiThread || ::poll(&descriptor, 1, 0) == 1)
        return ::poll(&descriptor, 1, int(deadline.remainingTime())) == 1;
    return QTest::qWaitFor([&descriptor] { return ::poll(&descriptor, 1, 0) == 1; }, int(deadline.remainingTime()));
}

} // namespace

PeerSocket::PeerSocket(int fd)
    : m_fd(fd)
{
}

PeerSocket::~PeerSocket()
{
    close();
}

PeerSocket::PeerSocket(PeerSocket&& other) noexcept
    : m_fd(std::exchange(other.m_fd, -1))
    , m_read(std::move(other.m_read))
{
}

PeerSocket& PeerSocket::operator=(PeerSocket&& other) noexcept
{
    std::swap(m_fd, other.m_fd);
    std::swap(m_read, other.m_read);
    return *this;
}

void PeerSocket::close()
{
    if (m_fd >= 0)
        ::close(std::exchange(m_fd, -1));
}

bool PeerSocket::sendLine(const QByteArray& line)
{
    return send(line + '\n');
}

bool PeerSocket::send(const QByteArray& bytes)
{
    const QDeadlineTimer deadline(FakePeer::deadline);
    qint64 sent = 0;
    while (sent < bytes.size()) {
        if (!ready(m_fd, POLLOUT, deadline))
            return false;
        const auto count =
            ::send(m_fd, bytes.constData() + sent, size_t(bytes.size() - sent), MSG_NOSIGNAL | MSG_DONTWAIT);
        if (count < 0 && errno != EAGAIN)
            return false;
        sent += qMax<qint64>(count, 0);
    }
    return true;
}

qint64 PeerSocket::sendSome(const QByteArray& bytes)
{
    return ::send(m_fd, bytes.constData(), size_t(bytes.size()), MSG_NOSIGNAL | MSG_DONTWAIT);
}

QByteArray PeerSocket::readLine()
{
    const QDeadlineTimer deadline(FakePeer::deadline);
    while (!m_read.contains('\n')) {
        char buffer[4096];
        const auto count = ready(m_fd, POLLIN, deadline) ? ::recv(m_fd, buffer, sizeof buffer, 0) : 0;
        if (count <= 0)
            return QByteArray();
        m_read.append(buffer, int(count));
    }
    const int end = int(m_read.indexOf('\n'));
    const QByteArray line = m_read.left(end);
    m_read.remove(0, end + 1);
    return line;
}

bool PeerSocket::waitForHangUp()
{
    const QDeadlineTimer deadline(FakePeer::deadline);
    char buffer[4096];
    while (ready(m_fd, POLLIN, deadline)) {
        const auto count = ::recv(m_fd, buffer, sizeof buffer, 0);
        if (count <= 0)
            return true;
    }
    return false;
}

bool PeerSocket::greet()
{
    return isOpen() && readLine() == "{\"protocol\":1,\"peer\":\"hmi\"}"
           && sendLine("{\"protocol\":1,\"peer\":\"application-layer\"}");
}

bool PeerSocket::greetWithSnapshot(const QByteArray& stateLines)
{
    return greet() && send(stateLines) && sendLine("{\"snapshot\":\"complete\"}");
}

FakePeer::FakePeer()
{
    listen();
}

FakePeer::~FakePeer()
{
    die();
}

void FakePeer::listen()
{
    for (int i = 0; i < 3; ++i) {
        sockaddr_un address{};
        address.sun_family = AF_UNIX;
        const QByteArray path = QFile::encodeName(directory()) + '/' + channels[i];
        ::unlink(path.constData());
        std::snprintf(address.sun_path, sizeof address.sun_path, "%s", path.constData());
        m_listeners[i] = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
        if (::bind(m_listeners[i], reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0
            || ::listen(m_listeners[i], 8) != 0)
            qFatal("cannot listen on %s", path.constData());
    }
}

void FakePeer::die()
{
    for (int& listener : m_listeners)
        if (listener >= 0)
            ::close(std::exchange(listener, -1));
}

PeerSocket FakePeer::accept(const char* channel)
{
    const QDeadlineTimer timer(deadline);
    int listener = -1;
    for (int i = 0; i < 3; ++i)
        if (!std::strcmp(channels[i], channel))
            listener = m_listeners[i];
    while (ready(listener, POLLIN, timer)) {
        PeerSocket socket(::accept4(listener, nullptr, nullptr, SOCK_CLOEXEC));
        pollfd hungUp{socket.fd(), POLLRDHUP, 0};
        if (::poll(&hungUp, 1, 0) == 0)
            return socket;
    }
    return PeerSocket();
}
