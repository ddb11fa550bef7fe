// SPDX-License-Identifier: MIT
#include "HmiVehicle/vehicleservice.h"

#include "connection.h"

#include <algorithm>
#include <unistd.h>

namespace HmiVehicle {

namespace {
constexpr int tick = 50; ///< milliseconds
constexpr int maximumConnections = 8;
} // namespace

VehicleService::VehicleService(const Vehicle::Options& options, QObject* parent)
    : QObject(parent)
    , m_vehicle(options, [this](Channel channel, const QByteArray& line) { broadcast(channel, line); })
{
    m_elapsed.start();
    if (!options.frozen)
        m_clock.start(tick, this);
}

VehicleService::~VehicleService()
{
    qDeleteAll(m_connections); // before the vehicle that they talk to
}

void VehicleService::addConnection(Channel channel, int socket)
{
    const auto others =
        std::count_if(m_connections.cbegin(), m_connections.cend(),
                      [channel](const Connection* connection) { return connection->channel() == channel; });
    if (others >= maximumConnections) {
        ::close(socket);
        return;
    }
    auto* const connection = new Connection(socket, channel, this);
    m_connections.append(connection);
    connect(connection, &Connection::greetedByPeer, this, [this, connection] {
        if (connection->channel() == Channel::Messages)
            connection->send(m_vehicle.snapshot());
    });
    connect(connection, &Connection::lineReceived, this,
            [this, connection](const QByteArray& line) { receive(connection, line); });
    connect(connection, &Connection::closed, this, [this, connection] { forget(connection); });
    connection->start();
}

void VehicleService::broadcast(Channel channel, const QByteArray& line)
{
    const QList<Connection*> connections = m_connections; // one may leave meanwhile
    for (Connection* const connection : connections)
        if (connection->channel() == channel && connection->greeted())
            connection->send(line);
}

void VehicleService::receive(Connection* connection, const QByteArray& line)
{
    const QString problem = m_vehicle.receive(connection->channel(), line);
    if (problem.isEmpty())
        Q_EMIT called(line);
    else
        connection->complain(problem);
}

void VehicleService::forget(Connection* connection)
{
    m_connections.removeOne(connection);
    const bool someLeft = std::any_of(m_connections.cbegin(), m_connections.cend(),
                                      [](const Connection* other) { return other->channel() == Channel::Messages; });
    if (!someLeft)
        m_vehicle.peerLost();
}

void VehicleService::timerEvent(QTimerEvent*)
{
    m_vehicle.advance(int(qMin<qint64>(m_elapsed.restart(), 60000)));
}

} // namespace HmiVehicle
