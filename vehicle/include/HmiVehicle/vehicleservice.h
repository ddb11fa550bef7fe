// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/vehicle.h"

#include <QBasicTimer>
#include <QElapsedTimer>
#include <QJsonObject>
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

    /// \brief Whether time passes by itself, not by Vehicle::advance() only.
    bool timePasses() const { return m_clock.isActive(); }

    /// \brief How many HMIs have greeted on \a channel.
    int hmiCount(Channel channel) const;
    /// \brief Bytes that are on their way to HMIs that have not read them yet.
    qint64 waitingBytes() const;

Q_SIGNALS:
    /// \brief An HMI called; the call was valid and is done.
    void called(const QByteArray& line);
    /// \brief Fields of a source changed; the HMIs were told.
    void stateChanged(const QString& source, const QJsonObject& changes);
    /// \brief A key, or a combination of keys, changed its state; numbers as on the wire.
    void keySent(int key, int state);
    void combinationSent(int combination, int state);
    /// \brief An HMI told what it decided, as it does while DeveloperSource.decisionsWanted; for people.
    void decisionReported(const QString& text);
    /// \brief An HMI came or went on a channel.
    void hmisChanged();
    /// \brief An HMI has handled all that came before that fence.
    void fenceReached(int number);

protected:
    void timerEvent(QTimerEvent* event) override;

private:
    void broadcast(Channel channel, const QByteArray& line);
    void receive(Connection* connection, Channel channel, const QByteArray& line);
    void forget(Connection* connection);
    int count(Channel channel, bool greetedOnly) const;

    struct Hmi
    {
        Connection* connection;
        Channel channel;
    };

    QList<Hmi> m_connections;
    Vehicle m_vehicle;
    QBasicTimer m_clock;
    QElapsedTimer m_elapsed;
    const double m_speed;
    double m_rest = 0; ///< milliseconds of the vehicle's time that are not whole yet
};

} // namespace HmiVehicle
