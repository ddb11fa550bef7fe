// SPDX-License-Identifier: MIT
#pragma once

#include <QSize>
#include <QString>
#include <QStringList>

/// What the head unit was asked to do on its command line.
struct CommandLine
{
    enum Outcome { Run, Done, Wrong };

    /// Reads the arguments. Done means that the text asked for (help, version) is in \ref message; Wrong, that \ref message
    /// says what is wrong with them.
    static CommandLine parse(const QStringList& arguments);

    Outcome outcome = Run;
    QString message;
    QString vehicleDirectory; ///< empty for the vehicle that is built in
    QString shotFile;         ///< empty to run
    QString view;             ///< view or popup to show, empty for the start screen
    QString tourFile;         ///< empty for no tour
    QString pictures;         ///< folder for the pictures of the tour, empty for none
    QString startupReport;    ///< picture of the start-up, after which the head unit ends; empty for none
    QString recordFile;       ///< empty for no recording
    QSize size{1280, 720};
    int country = -1;  ///< that the built-in vehicle is made for, -1 for its own
    int language = -1; ///< that it is set to, -1 for its own
    bool night = false;
    bool listViews = false;
};
