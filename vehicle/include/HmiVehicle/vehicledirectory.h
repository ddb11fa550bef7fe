// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/wire.h"

#include <QObject>
#include <QSocketNotifier>

#include <functional>
#include <memory>
#include <vector>

namespace HmiVehicle {

/// \brief Listens on the three sockets of the protocol and on `control` in a directory that only this user may enter. Needs the event loop of its thread.
class VehicleDirectory : public QObject
{
    Q_OBJECT

public:
    explicit VehicleDirectory(QObject* parent = nullptr);
    /// \brief Removes the sockets, not the directory.
    ~VehicleDirectory() override;

    /// \brief `$HMI_BRIDGE_DIR`, else `$XDG_RUNTIME_DIR/hmi-bridge`, else one of the user below that for temporary files.
    static QString defaultPath();

    /// \brief Makes the directory (0700) when it is missing, clears what a dead vehicle left, and listens.
    ///
    /// False when the directory is not ours alone, when another vehicle serves it or when the system refuses;
    /// errorString() says which.
    bool listen(const QString& path);
    QString errorString() const { return m_error; }

Q_SIGNALS:
    /// \brief An HMI of this user connected; the receiver owns the socket.
    void connected(HmiVehicle::Channel channel, int socket);
    /// \brief A script, panel or keyboard of this user connected; the receiver owns the socket.
    void controlConnected(int socket);

private:
    struct Listener;

    bool openDirectory(const QString& path);
    bool listenOn(const QString& name, std::function<void(int socket)> connected);
    void accept(const Listener& listener);
    bool fail(const QString& problem);

    QString m_path;
    QString m_error;
    int m_directory = -1;
    std::vector<std::unique_ptr<Listener>> m_listeners;
};

} // namespace HmiVehicle
