// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/vehicle.h"

#include <QBasicTimer>
#include <QElapsedTimer>
#include <QList>
#include <QObject>

namespace HmiVehicle {

class Connection;

/// \brief A vehicle with connections: tells every HMI what changes and lets time pass. Needs the event loop of its thread.
class VehicleService : public QObject
{
    Q_OBJECT

public:
    explicit VehicleService(const Vehicle::Options& options, QObject* parent = nullptr);
    ~VehicleService() override;

    Vehicle& vehicle() { return m_vehicle; }

    /// \brief Serves an HMI on a connected stream socket, which it owns then. More than eight on a channel are refused.
    void addConnection(HmiVehicle::Channel channel, int socket);

Q_SIGNALS:
    /// \brief An HMI called; the call was valid and is done.
    void called(const QByteArray& line);

protected:
    void timerEvent(QTimerEvent* event) override;

private:
    void broadcast(Channel channel, const QByteArray& line);
    void receive(Connection* connection, const QByteArray& line);
    void forget(Connection* connection);

    QList<Connection*> m_connections;
    Vehicle m_vehicle;
    QBasicTimer m_clock;
    QElapsedTimer m_elapsed;
};

} // namespace HmiVehicle
