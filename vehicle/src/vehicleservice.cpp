// SPDX-License-Identifier: MIT
#include "HmiVehicle/vehicleservice.h"

#include "peers.h"

#include <algorithm>
#include <unistd.h>
#include <utility>

namespace HmiVehicle {

namespace {
constexpr int tick = 50; ///< milliseconds
constexpr int maximumConnections = 8;
} // namespace

VehicleService::VehicleService(const Vehicle::Options& options, QObject* parent)
    : QObject(parent)
    , m_vehicle(options, [this](Channel channel, const QByteArray& line) { broadcast(channel, line); })
    , m_speed(options.speed)
{
    m_vehicle.setObserver(
        {[this](const QString& source, const QJsonObject& changes) { Q_EMIT stateChanged(source, changes); },
         [this](int key, int state) { Q_EMIT keySent(key, state); },
         [this](int combination, int state) { Q_EMIT combinationSent(combination, state); },
         [this](const QString& text) { Q_EMIT decisionReported(text); },
         [this](int number) { Q_EMIT fenceReached(number); }});
    m_elapsed.start();
    if (!options.frozen && options.speed > 0)
        m_clock.start(tick, this);
}

VehicleService::~VehicleService()
{
    for (const Hmi& hmi : std::as_const(m_connections))
        delete hmi.connection; // before the vehicle that they talk to
}

void VehicleService::addConnection(Channel channel, int socket)
{
    if (count(channel, false) >= maximumConnections) {
        ::close(socket);
        return;
    }
    auto* const connection = new Connection(socket, hmiPeer(channel), this);
    m_connections.append({connection, channel});
    connect(connection, &Connection::greetedByPeer, this, [this, connection, channel] {
        if (channel == Channel::Messages)
            connection->send(m_vehicle.snapshot());
        Q_EMIT hmisChanged();
    });
    connect(connection, &Connection::lineReceived, this,
            [this, connection, channel](const QByteArray& line) { receive(connection, channel, line); });
    connect(connection, &Connection::closed, this, [this, connection] { forget(connection); });
    connection->start();
}

qint64 VehicleService::waitingBytes() const
{
    qint64 bytes = 0;
    for (const Hmi& hmi : m_connections)
        bytes += hmi.connection->waiting();
    return bytes;
}

int VehicleService::hmiCount(Channel channel) const
{
    return count(channel, true);
}

int VehicleService::count(Channel channel, bool greetedOnly) const
{
    return int(std::count_if(m_connections.cbegin(), m_connections.cend(), [&](const Hmi& hmi) {
        return hmi.channel == channel && (hmi.connection->greeted() || !greetedOnly);
    }));
}

void VehicleService::broadcast(Channel channel, const QByteArray& line)
{
    const QList<Hmi> hmis = m_connections; // one may leave meanwhile
    for (const Hmi& hmi : hmis)
        if (hmi.channel == channel && hmi.connection->greeted())
            hmi.connection->send(line);
}

void VehicleService::receive(Connection* connection, Channel channel, const QByteArray& line)
{
    const QString problem = m_vehicle.receive(channel, line);
    if (problem.isEmpty())
        Q_EMIT called(line);
    else
        connection->complain(problem);
}

void VehicleService::forget(Connection* connection)
{
    const auto gone = std::find_if(m_connections.cbegin(), m_connections.cend(),
                                   [connection](const Hmi& hmi) { return hmi.connection == connection; });
    m_connections.removeAt(int(gone - m_connections.cbegin()));
    if (count(Channel::Messages, false) == 0)
        m_vehicle.peerLost();
    Q_EMIT hmisChanged();
}

void VehicleService::timerEvent(QTimerEvent*)
{
    const double passed = double(qMin<qint64>(m_elapsed.restart(), 60000)) * m_speed + m_rest;
    const int whole = int(qMin(passed, 86400000.0));
    m_rest = passed - whole;
    m_vehicle.advance(whole);
}

} // namespace HmiVehicle
