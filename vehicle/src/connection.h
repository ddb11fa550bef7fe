// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/wire.h"

#include <QObject>
#include <QSocketNotifier>

namespace HmiVehicle {

/// One HMI's end on one channel. It never waits; a peer that stalls, floods or speaks something else is hung up on.
class Connection : public QObject
{
    Q_OBJECT

public:
    /// Owns \a socket.
    Connection(int socket, Channel channel, QObject* parent);
    ~Connection() override;

    /// Greets, once all its signals are connected.
    void start();

    Channel channel() const { return m_channel; }
    bool greeted() const { return m_greeted; }
    void send(const QByteArray& lines);
    /// One warning about what the peer sent; from the twentieth on none.
    void complain(const QString& problem);

Q_SIGNALS:
    void greetedByPeer();
    void lineReceived(const QByteArray& line);
    void closed();

protected:
    void timerEvent(QTimerEvent* event) override;

private:
    void readSome();
    void takeLine(const QByteArray& line);
    void flush();
    void hangUp(const QString& reason = QString());

    const int m_socket;
    const Channel m_channel;
    QSocketNotifier m_readable;
    QSocketNotifier m_writable;
    QByteArray m_partial;
    QByteArray m_waiting;
    bool m_greeted = false;
    bool m_open = true;
    int m_complaints = 0;
    int m_greetingTimer = 0;
};

} // namespace HmiVehicle
