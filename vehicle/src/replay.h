// SPDX-License-Identifier: MIT
#pragma once

#include "recording.h"

#include <QList>
#include <QObject>
#include <QStringList>
#include <QTimer>

#include <array>
#include <vector>

namespace HmiVehicle {

class Connection;

/// The other end of a recorded HMI: sends what it received then, and compares what it sends now. Needs an event loop.
///
/// A line is not sent before what the HMI had sent by then has come, or a while has passed; and not before the HMI has handled
/// what was sent on another channel, if it answers fences. So the outcome does not depend on how fast the HMI is.
class Replay : public QObject
{
    Q_OBJECT

public:
    explicit Replay(QObject* parent = nullptr);
    ~Replay() override;

    bool load(const QString& fileName);
    QString errorString() const { return m_error; }

    /// Waits for the HMI to connect, then plays. \a speed 1 is the pace of the recording; 0 is at once.
    void play(double speed);
    void addConnection(HmiVehicle::Channel channel, int socket);

    /// After finished(): what was missing, extra or changed, for people.
    QStringList differences() const;

Q_SIGNALS:
    /// \a problem is empty, or why it could not be played to its end.
    void finished(const QString& problem);

private:
    struct Side
    {
        QList<Connection*> arrived; ///< greeted, not used yet
        Connection* connection = nullptr;
        std::vector<QByteArray> expected;
        std::vector<int> numbers; ///< of the lines in the file
        std::vector<QByteArray> actual;
        size_t waitedFor = 0; ///< expected lines that are not waited for (any more)
    };

    Side& side(Channel channel) { return m_sides[size_t(channel)]; }
    void take(Channel channel, const QByteArray& line);
    void step();
    bool playEntry(const Recording::Entry& entry);
    bool delayIsOver(const Recording::Entry& entry);
    bool answersAreHere();
    bool channelIsReady(const Recording::Entry& entry);
    bool othersAreHandled(Channel channel);
    void giveUpWaiting();
    void end(const QString& problem);

    Recording m_recording;
    QString m_fileName;
    QString m_error;
    std::array<Side, 3> m_sides;
    QTimer m_delay;
    QTimer m_patience;
    double m_speed = 1;
    double m_lastTime = 0;
    size_t m_next = 0;
    bool m_playing = false;
    bool m_stepping = false;
    bool m_delayed = false;    ///< the present entry's delay has begun
    bool m_wantsFence = false; ///< lines were sent on m_lastChannel since the last fence
    bool m_isFenced = false;   ///< a fence is on its way
    bool m_answersFences = true;
    int m_fence = 0;
    Channel m_lastChannel = Channel::Messages;
};

} // namespace HmiVehicle
