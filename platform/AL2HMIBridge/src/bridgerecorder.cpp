// SPDX-License-Identifier: MIT
#include "bridgerecorder.h"

#include "recordingwriter.h"

#include <QFile>
#include <QFileInfo>

#include <utility>

namespace AL2HMIBridge {

namespace {
RecordingWriter* tappedWriter = nullptr; // whose lines the tap takes; GUI thread
}

BridgeRecorder::BridgeRecorder(QObject* parent)
    : QObject(parent)
{
}

BridgeRecorder::~BridgeRecorder()
{
    stop();
}

bool BridgeRecorder::start(const QString& fileName)
{
    stop();
    const QFileInfo existing(fileName);
    auto file = std::make_unique<QFile>(fileName);
    if (existing.exists() && !existing.isFile()) {
        m_error = fileName + QStringLiteral(": not a regular file");
        return false;
    }
    if (!file->open(QIODevice::WriteOnly | QIODevice::Truncate)) {
        m_error = fileName + QStringLiteral(": ") + file->errorString();
        return false;
    }
    file->setPermissions(QFile::ReadOwner | QFile::WriteOwner);
    m_error.clear();
    m_writer = std::make_unique<RecordingWriter>(std::move(file));
    tappedWriter = m_writer.get();
    setTap([writer = m_writer.get()](BridgeEndpoint::Channel channel, Direction direction, const QByteArray& line,
                                     bool isJson) { writer->add(channel, direction, line, isJson); });
    return true;
}

void BridgeRecorder::stop()
{
    if (!m_writer)
        return;
    if (tappedWriter == m_writer.get()) {
        setTap({});
        tappedWriter = nullptr;
    }
    m_dropped = m_writer->dropped();
    m_writer.reset();
}

qint64 BridgeRecorder::droppedLines() const
{
    return m_writer ? m_writer->dropped() : m_dropped;
}

} // namespace AL2HMIBridge
