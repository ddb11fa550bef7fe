// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

#include <vector>

/// What the command line asks for.
struct Options
{
    enum Task { Serve, Send, Play, ShowHelp };

    /// False when it is wrong; then \a message says why. Of ShowHelp it is the text.
    bool parse(const QStringList& arguments);

    void takeCommands(const QStringList& words);

    Task task = Serve;
    QString message;
    QString directory;
    bool frozen = false;
    bool panel = false;  ///< with the control panel in a window
    QString pictureFile; ///< of the panel, then the end
    double speed = 1;
    int timeout = -1; ///< milliseconds, below 0 for the usual time
    bool desktopPlayer = false;
    bool modem = false;
    QStringList devices; ///< input devices that have hard keys
    QString keyMap;      ///< file, empty for the shipped one
    std::vector<QStringList> commands;
    QString file;    ///< to play
    QStringList hmi; ///< program and arguments to start
};
