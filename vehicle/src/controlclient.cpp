// SPDX-License-Identifier: MIT
#include "HmiVehicle/controlclient.h"

#include "peers.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <fcntl.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>
#include <utility>

namespace HmiVehicle {

namespace {

/// A socket connected to `control` in the directory, or -1. Through the opened directory, so that a long path does no harm.
int connectIn(int directory, QString* problem)
{
    const int socket = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::snprintf(address.sun_path, sizeof address.sun_path, "/proc/self/fd/%d/control", directory);
    ucred peer{};
    socklen_t size = sizeof peer;
    if (::connect(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0)
        *problem = QStringLiteral("no vehicle serves it");
    else if (::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &size) != 0 || peer.uid != ::geteuid())
        *problem = QStringLiteral("another user's vehicle serves it");
    else
        return socket;
    ::close(socket);
    return -1;
}

int connectTo(const QString& path, QString* problem)
{
    const int directory = ::open(QFile::encodeName(path).constData(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC);
    if (directory < 0) {
        *problem =
            errno == ENOENT ? QStringLiteral("no vehicle serves it") : QString::fromLocal8Bit(std::strerror(errno));
        return -1;
    }
    struct stat status
    {};
    int socket = -1;
    if (::fstat(directory, &status) != 0 || status.st_uid != ::geteuid() || (status.st_mode & (S_IRWXG | S_IRWXO)))
        *problem = QStringLiteral("other users may enter it; it must be this user's and of mode 0700");
    else
        socket = connectIn(directory, problem);
    ::close(directory);
    return socket;
}

} // namespace

ControlClient::ControlClient(QObject* parent)
    : QObject(parent)
{
}

ControlClient::~ControlClient() = default;

bool ControlClient::open(const QString& directory)
{
    close();
    m_directory = directory;
    QString problem;
    const int socket = connectTo(directory, &problem);
    if (socket < 0) {
        m_error = directory + QStringLiteral(": ") + problem;
        return false;
    }
    auto* const connection = new Connection(socket, vehiclePeer(), this);
    m_connection = connection;
    connect(connection, &Connection::lineReceived, this, &ControlClient::take);
    connect(connection, &Connection::closed, this, [this] {
        m_connection = nullptr; // it deletes itself
        Q_EMIT lost();
    });
    connection->start();
    return isOpen();
}

void ControlClient::close()
{
    delete std::exchange(m_connection, nullptr);
}

bool ControlClient::press(int key)
{
    return sendKey({QStringLiteral("press"), QString::number(key)});
}

bool ControlClient::release(int key)
{
    return sendKey({QStringLiteral("release"), QString::number(key)});
}

bool ControlClient::turn(int key, int steps)
{
    return sendKey({QStringLiteral("turn"), QString::number(key), QString::number(steps)});
}

bool ControlClient::sendKey(const QStringList& words)
{
    if (!isOpen() && (m_directory.isEmpty() || !open(m_directory)))
        return false;
    return send(words);
}

int ControlClient::send(const QStringList& words, int timeout)
{
    if (!isOpen())
        return 0;
    QJsonObject line{{QStringLiteral("id"), ++m_lastNumber},
                     {QStringLiteral("command"), QJsonArray::fromStringList(words)}};
    if (timeout >= 0)
        line.insert(QStringLiteral("timeout"), timeout);
    m_connection->send(QJsonDocument(line).toJson(QJsonDocument::Compact) + '\n');
    return isOpen() ? m_lastNumber : 0;
}

void ControlClient::take(const QByteArray& line)
{
    const QJsonObject answer = QJsonDocument::fromJson(line).object();
    Q_EMIT replied(answer.value(QLatin1String("id")).toInt(), answer.value(QLatin1String("error")).toString(),
                   answer.value(QLatin1String("value")));
}

} // namespace HmiVehicle
