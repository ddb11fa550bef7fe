// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"

#include <QObject>
#include <QString>

#include <memory>

namespace AL2HMIBridge {

struct Playback;

/// \brief Feeds what a recording received to the sources once more. GUI thread only.
///
/// The lines go through the same checks as those of a peer; connections and snapshots mean what they meant. Do not play
/// while a peer is connected: both would report state.
class AL2HMIBRIDGE_EXPORT BridgePlayer : public QObject
{
    Q_OBJECT

public:
    explicit BridgePlayer(QObject* parent = nullptr);
    ~BridgePlayer() override;

    /// \brief Reads a recording of at most 256 MiB. False when it cannot be read; errorString() names file and line.
    bool load(const QString& fileName);

    /// \brief Plays what was loaded from its beginning: \a speed 1 at the pace of the recording, 2 twice as fast, 0 at once.
    ///
    /// False when nothing is loaded or \a speed is negative.
    bool play(double speed = 1.0);

    /// \brief Stops where it is, without finished().
    void stop();

    /// \brief Why load() failed last.
    QString errorString() const { return m_error; }

Q_SIGNALS:
    /// \brief The last line was played.
    void finished();

protected:
    void timerEvent(QTimerEvent* event) override;

private:
    void playDueLines();

    std::unique_ptr<Playback> m_playback;
    QString m_error;
};

} // namespace AL2HMIBridge
