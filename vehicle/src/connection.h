// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QList>
#include <QObject>
#include <QSocketNotifier>

namespace HmiVehicle {

/// Who is at the other end of a connection, and what is asked of it.
struct Peer
{
    QString name; ///< for warnings
    QByteArray ownGreeting;
    QList<QByteArray> greetings; ///< one of them must be its first line
    QString protocol;            ///< for the warning about another one
    int maximumLine;             ///< bytes, line end included
};

/// One end of a connection that carries lines. A peer that stalls, floods or speaks something else is hung up on. It waits
/// only for a peer that reads too slowly, so that nothing is lost while that one does read.
class Connection : public QObject
{
    Q_OBJECT

public:
    /// Owns \a socket.
    Connection(int socket, Peer peer, QObject* parent);
    ~Connection() override;

    /// Greets, once all its signals are connected.
    void start();

    bool greeted() const { return m_greeted; }
    int waiting() const { return int(m_waiting.size()) - m_sent; } ///< bytes that the peer has not read
    void send(const QByteArray& lines);
    /// One warning about what the peer sent; from the twentieth on none.
    void complain(const QString& problem);
    /// Ends the connection, with a warning when there is a reason; it deletes itself.
    void hangUp(const QString& reason = QString());

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
    bool drain();

    const int m_socket;
    const Peer m_peer;
    QSocketNotifier m_readable;
    QSocketNotifier m_writable;
    QByteArray m_partial;
    QByteArray m_waiting;
    int m_sent = 0; ///< bytes at the beginning of m_waiting that are gone
    bool m_greeted = false;
    bool m_open = true;
    int m_complaints = 0;
    int m_greetingTimer = 0;
};

} // namespace HmiVehicle
