// SPDX-License-Identifier: MIT
#pragma once

#include "tap.h"

#include <QFile>

#include <chrono>
#include <condition_variable>
#include <deque>
#include <memory>
#include <mutex>
#include <thread>

namespace AL2HMIBridge {

/// The thread that writes a recording, and its queue.
class RecordingWriter
{
public:
    /// \a file is open for writing.
    explicit RecordingWriter(std::unique_ptr<QFile> file);
    /// Writes what waits first.
    ~RecordingWriter();
    Q_DISABLE_COPY(RecordingWriter)

    /// Any thread; never waits for the file.
    void add(BridgeEndpoint::Channel channel, Direction direction, const QByteArray& line, bool isJson);
    qint64 dropped() const;

private:
    struct Entry
    {
        std::chrono::steady_clock::time_point time;
        BridgeEndpoint::Channel channel;
        Direction direction;
        QByteArray line;
        bool isJson;
        qint64 droppedBefore;
    };

    void run();
    void write(const Entry& entry);
    void put(const QByteArray& line);
    QByteArray stamp(const Entry& entry) const;

    std::unique_ptr<QFile> m_file;
    const std::chrono::steady_clock::time_point m_start;
    mutable std::mutex m_mutex;
    std::condition_variable m_changed;
    std::deque<Entry> m_queue;
    qint64 m_waitingBytes = 0;
    qint64 m_dropped = 0;
    qint64 m_droppedSinceEntry = 0;
    bool m_ending = false;
    bool m_failed = false; ///< the thread's own
    std::thread m_thread;
};

} // namespace AL2HMIBridge
