// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

/// \brief Brings one view or popup to the screen, saves its picture and ends the program. GUI thread only.
///
/// Exit codes: 0 the picture is written; 1 it could not be drawn or written, or the vehicle did not answer; 2 there is
/// no such view or popup. Errors go to standard error.
class Screenshot : public QObject
{
    Q_OBJECT

public:
    Screenshot(const QString& file, const QString& view, QObject* parent);

    /// \brief Waits for the state of the vehicle, asks for the view, and goes on from there.
    void start();

    /// \brief Whether there is a view, popup or state of this name; otherwise \a message lists what there is.
    static bool isKnown(const QString& view, QString* message);

private:
    void showView();
    void shoot();
    void fail(int exitCode, const QString& message);

    const QString m_file;
    const QString m_view;
};
