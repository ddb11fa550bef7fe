// SPDX-License-Identifier: MIT
#include "dialer.h"

#include "bridgelog.h"

#include <QByteArray>
#include <QFile>

#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>

namespace AL2HMIBridge {

namespace {

/// The opened directory, so that what was checked is what is used.
FileDescriptor openOwnDirectory(const QString& path, QString* problem)
{
    FileDescriptor directory(
        ::open(QFile::encodeName(path).constData(), O_PATH | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
    if (!directory.isValid()) {
        if (errno == EMFILE || errno == ENFILE)
            *problem = QStringLiteral("the process has no descriptor left");
        else if (errno != ENOENT)
            *problem = QStringLiteral("it is not a directory that can be opened");
        return directory;
    }
    struct stat status
    {};
    if (::fstat(directory.get(), &status) != 0 || status.st_uid != ::geteuid())
        *problem = QStringLiteral("it belongs to another user");
    else if (status.st_mode & (S_IRWXG | S_IRWXO))
        *problem = QStringLiteral("other users may enter it; its mode must be 0700");
    return problem->isEmpty() ? std::move(directory) : FileDescriptor();
}

/// As root no permission keeps others out, so that it is the listener's identity that counts.
bool isOwnPeer(int socket)
{
    ucred peer{};
    socklen_t size = sizeof peer;
    return ::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 && peer.uid == ::geteuid();
}

} // namespace

Dialer::Dialer(BridgeEndpoint::Channel channel)
    : m_channel(channel)
{
}

FileDescriptor Dialer::connectInDirectory(QString* problem) const
{
    const QString path = BridgeEndpoint::directory();
    const FileDescriptor directory = openOwnDirectory(path, problem);
    if (!directory.isValid()) {
        if (!problem->isEmpty())
            *problem = QStringLiteral("Socket directory %1 refused: %2").arg(path, *problem);
        return FileDescriptor();
    }
    FileDescriptor socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::snprintf(address.sun_path, sizeof address.sun_path, "/proc/self/fd/%d/%s", directory.get(),
                  qPrintable(BridgeEndpoint::channelName(m_channel)));
    const bool connected = ::connect(socket.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
    return connected ? std::move(socket) : FileDescriptor();
}

FileDescriptor Dialer::dial()
{
    QString problem;
    const BridgeEndpoint::Connector connector = BridgeEndpoint::connector();
    FileDescriptor socket = connector ? FileDescriptor(connector(m_channel)) : connectInDirectory(&problem);
    if (socket.isValid() && !isOwnPeer(socket.get())) {
        problem =
            QStringLiteral("Peer on %1 refused: it is run by another user").arg(BridgeEndpoint::channelName(m_channel));
        socket = FileDescriptor();
    }
    if (!problem.isEmpty() && problem != m_reported)
        qCWarning(bridgeLog).noquote() << problem;
    if (!problem.isEmpty() || socket.isValid())
        m_reported = problem;
    return socket;
}

} // namespace AL2HMIBridge
