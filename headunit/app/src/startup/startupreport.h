// SPDX-License-Identifier: MIT
#pragma once

#include "startuptimeline.h"

#include <QObject>

/// \brief Follows the start of the head unit to its first frame, and writes down what took how long.
///
/// Made once, at the beginning of main() and in its thread, before the application object. The core and the framework tell
/// of their milestones in the log; those lines are read here and do not appear there.
class StartupReport : public QObject
{
    Q_OBJECT

public:
    StartupReport();
    ~StartupReport() override;

    /// Follows the application from here on; before HmiApplication::initialize().
    void attachModules();

    /// After HmiApplication::initialize(), before startHmi().
    void attachWindow();

    const StartupTimeline& timeline() const { return m_timeline; }

    /// \brief Writes the picture to \a file and the trace beside it, with the suffix ".json". False, with a text for people in
    /// \a error, when one of them cannot be written.
    static bool write(const StartupTimeline& timeline, const QString& file, QString* error);

    /// The trace's file name.
    static QString traceFile(const QString& file);

Q_SIGNALS:
    /// Once, when the first frame is on the screen.
    void complete();

private:
    friend void readMilestone(QtMsgType type, const QMessageLogContext& context, const QString& message);

    void endPhase(const QString& name);

    StartupTimeline m_timeline;
    qint64 m_start = 0; ///< ns of the monotonic clock
    QtMessageHandler m_previous = nullptr;
    bool m_hasView = false;
};
