// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

/// \brief The command line of hmi-plugin-check.
struct Arguments
{
    enum Outcome {
        Run,   ///< check the file
        Done,  ///< print the message, all is well
        Wrong, ///< print the message, the command line is wrong
    };

    /// \brief Reads the command line; looks at the files that it names.
    static Arguments parse(const QStringList& commandLine);

    Outcome outcome = Run;
    QString message;
    QString file;       ///< of the plugin, absolute
    QString lists;      ///< a plugins.conf, absolute, or empty
    int timeLimit = 20; ///< seconds
    bool json = false;
    bool strict = false; ///< problems that the head unit lives with count as well
};
