// SPDX-License-Identifier: MIT
#include "HmiVehicle/vehicledirectory.h"

#include <QDir>
#include <QFile>
#include <QLoggingCategory>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>
#include <utility>

namespace HmiVehicle {

Q_DECLARE_LOGGING_CATEGORY(vehicleLog)

struct VehicleDirectory::Listener
{
    Listener(int listeningSocket, const QString& socketName, std::function<void(int)> whenConnected)
        : socket(listeningSocket)
        , name(socketName)
        , connected(std::move(whenConnected))
        , notifier(listeningSocket, QSocketNotifier::Read)
    {
    }
    ~Listener()
    {
        notifier.setEnabled(false);
        ::close(socket);
    }
    Q_DISABLE_COPY(Listener)

    const int socket;
    const QString name;
    const std::function<void(int)> connected;
    QSocketNotifier notifier;
};

VehicleDirectory::VehicleDirectory(QObject* parent)
    : QObject(parent)
{
}

VehicleDirectory::~VehicleDirectory()
{
    for (const auto& listener : m_listeners)
        ::unlinkat(m_directory, listener->name.toLatin1().constData(), 0);
    m_listeners.clear();
    if (m_directory >= 0)
        ::close(m_directory);
}

QString VehicleDirectory::defaultPath()
{
    const QString named = qEnvironmentVariable("HMI_BRIDGE_DIR");
    if (!named.isEmpty())
        return named;
    const QString runtime = qEnvironmentVariable("XDG_RUNTIME_DIR");
    if (!runtime.isEmpty())
        return runtime + QStringLiteral("/hmi-bridge");
    return QDir::tempPath() + QStringLiteral("/hmi-bridge-%1").arg(::geteuid());
}

bool VehicleDirectory::fail(const QString& problem)
{
    m_error = m_path + QStringLiteral(": ") + problem;
    return false;
}

bool VehicleDirectory::openDirectory(const QString& path)
{
    m_path = path;
    const QByteArray name = QFile::encodeName(path);
    if (::mkdir(name.constData(), 0700) != 0 && errno != EEXIST)
        return fail(QString::fromLocal8Bit(std::strerror(errno)));
    m_directory = ::open(name.constData(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC);
    struct stat status
    {};
    if (m_directory < 0 || ::fstat(m_directory, &status) != 0)
        return fail(QStringLiteral("not a directory that can be opened"));
    if (status.st_uid != ::geteuid() || (status.st_mode & (S_IRWXG | S_IRWXO)))
        return fail(QStringLiteral("other users may enter it; it must be this user's and of mode 0700"));
    if (::flock(m_directory, LOCK_EX | LOCK_NB) != 0)
        return fail(QStringLiteral("another vehicle serves it"));
    return true;
}

bool VehicleDirectory::listen(const QString& path)
{
    if (m_directory >= 0)
        return fail(QStringLiteral("it is served already"));
    if (!openDirectory(path))
        return false;
    for (const Channel channel : allChannels)
        if (!listenOn(channelName(channel), [this, channel](int socket) { Q_EMIT connected(channel, socket); }))
            return false;
    return listenOn(QStringLiteral("control"), [this](int socket) { Q_EMIT controlConnected(socket); });
}

/// Through the opened directory, so that a long path does no harm.
bool VehicleDirectory::listenOn(const QString& socketName, std::function<void(int)> whenConnected)
{
    const QByteArray name = socketName.toLatin1();
    ::unlinkat(m_directory, name.constData(), 0); // whoever had it is dead: we hold the lock
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::snprintf(address.sun_path, sizeof address.sun_path, "/proc/self/fd/%d/%s", m_directory, name.constData());
    const int socket = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
    if (socket < 0 || ::bind(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0
        || ::listen(socket, 8) != 0) {
        const QString problem = QString::fromLocal8Bit(std::strerror(errno));
        if (socket >= 0)
            ::close(socket);
        return fail(socketName + QStringLiteral(": ") + problem);
    }
    m_listeners.push_back(std::make_unique<Listener>(socket, socketName, std::move(whenConnected)));
    const Listener* const listener = m_listeners.back().get();
    connect(&listener->notifier, &QSocketNotifier::activated, this, [this, listener] { accept(*listener); });
    return true;
}

void VehicleDirectory::accept(const Listener& listener)
{
    const int socket = ::accept4(listener.socket, nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK);
    if (socket < 0)
        return;
    ucred peer{};
    socklen_t size = sizeof peer;
    if (::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 && peer.uid == ::geteuid()) {
        listener.connected(socket);
        return;
    }
    ::close(socket);
    qCWarning(vehicleLog).noquote() << "Refused on" << listener.name + QLatin1Char(':') << "it is run by another user";
}

} // namespace HmiVehicle
