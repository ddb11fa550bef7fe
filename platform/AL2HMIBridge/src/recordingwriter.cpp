// SPDX-License-Identifier: MIT
#include "recordingwriter.h"

#include "bridgelog.h"
#include "bridgelimits.h"

#include <QJsonDocument>
#include <QJsonObject>

#include <utility>

namespace AL2HMIBridge {

RecordingWriter::RecordingWriter(std::unique_ptr<QFile> file)
    : m_file(std::move(file))
    , m_start(std::chrono::steady_clock::now())
    , m_thread([this] { run(); })
{
}

RecordingWriter::~RecordingWriter()
{
    {
        const std::lock_guard<std::mutex> lock(m_mutex);
        m_ending = true;
    }
    m_changed.notify_one();
    m_thread.join();
}

void RecordingWriter::add(BridgeEndpoint::Channel channel, Direction direction, const QByteArray& line, bool isJson)
{
    bool firstLoss = false;
    {
        const std::lock_guard<std::mutex> lock(m_mutex);
        if (m_waitingBytes + line.size() > maximumRecordingQueue) {
            firstLoss = m_dropped++ == 0;
            ++m_droppedSinceEntry;
        } else {
            m_waitingBytes += line.size();
            const QByteArray own(line.constData(), line.endsWith('\n') ? int(line.size()) - 1 : int(line.size()));
            m_queue.push_back({std::chrono::steady_clock::now(), channel, direction, own, isJson,
                               std::exchange(m_droppedSinceEntry, 0)});
        }
    }
    m_changed.notify_one();
    if (firstLoss)
        qCWarning(bridgeLog) << "The recording cannot keep up; lines are left out";
}

qint64 RecordingWriter::dropped() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return m_dropped;
}

void RecordingWriter::run()
{
    std::unique_lock<std::mutex> lock(m_mutex);
    for (;;) {
        m_changed.wait(lock, [this] { return m_ending || !m_queue.empty(); });
        if (m_queue.empty())
            return;
        std::deque<Entry> entries;
        entries.swap(m_queue);
        lock.unlock();
        for (const Entry& entry : entries)
            write(entry);
        m_file->flush();
        lock.lock();
        for (const Entry& entry : entries)
            m_waitingBytes -= entry.line.size();
    }
}

QByteArray RecordingWriter::stamp(const Entry& entry) const
{
    const std::chrono::duration<double> since = entry.time - m_start;
    return "{\"t\":" + QByteArray::number(since.count(), 'f', 6) + ",\"channel\":\""
           + BridgeEndpoint::channelName(entry.channel).toLatin1() + "\",\"direction\":\""
           + (entry.direction == Direction::In ? "in" : "out") + "\",";
}

void RecordingWriter::write(const Entry& entry)
{
    if (entry.droppedBefore)
        put(stamp(entry) + "\"dropped\":" + QByteArray::number(entry.droppedBefore) + "}\n");
    if (entry.isJson)
        return put(stamp(entry) + "\"line\":" + entry.line + "}\n");
    const QJsonObject text{{QStringLiteral("text"), QString::fromUtf8(entry.line)}};
    put(stamp(entry) + QJsonDocument(text).toJson(QJsonDocument::Compact).mid(1) + '\n');
}

void RecordingWriter::put(const QByteArray& line)
{
    if (m_failed || m_file->write(line) == line.size())
        return;
    m_failed = true;
    qCWarning(bridgeLog).noquote() << "The recording ends early:" << m_file->fileName() + QLatin1Char(':')
                                   << m_file->errorString();
}

} // namespace AL2HMIBridge
