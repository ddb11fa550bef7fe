// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"

#include <QObject>
#include <QString>

#include <memory>

namespace AL2HMIBridge {

class RecordingWriter;

/// \brief Writes the lines of all channels, both ways, with monotonic timestamps into a file of JSON lines.
///
/// A thread of its own does the writing. Nobody waits for it: when it falls behind by 8 MiB, lines are left out, which the
/// recording itself and one warning say. One recorder at a time; a later start() takes over. GUI thread only.
class AL2HMIBRIDGE_EXPORT BridgeRecorder : public QObject
{
    Q_OBJECT

public:
    explicit BridgeRecorder(QObject* parent = nullptr);
    /// \brief Stops.
    ~BridgeRecorder() override;

    /// \brief Starts to write into \a fileName, whose old content is lost; readable by this user only.
    ///
    /// False when that is not a regular file or cannot be written; errorString() says why.
    bool start(const QString& fileName);

    /// \brief Writes what still waits and closes the file.
    void stop();

    /// \brief Why start() failed last, with the file's name.
    QString errorString() const { return m_error; }

    /// \brief How many lines the present or last recording left out.
    qint64 droppedLines() const;

private:
    std::unique_ptr<RecordingWriter> m_writer;
    QString m_error;
    qint64 m_dropped = 0;
};

} // namespace AL2HMIBridge
