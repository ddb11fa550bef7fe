// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>

/// \brief How the process ended that loaded a plugin, and what it reported until then.
struct ProbeResult
{
    enum End {
        NotStarted, ///< nothing is known of the plugin; error says why
        Exited,
        Crashed,
        Hung, ///< and was killed
    };

    End end = NotStarted;
    int code = 0; ///< exit code or signal
    QString error;
    QString lastOutput; ///< the last lines that the process wrote to its output, bounded
    QJsonObject report; ///< see ProbeLog
};

/// \brief Lays out a head unit that has only this plugin, in a temporary directory, and runs it.
///
/// \a lists is a plugins.conf, or empty. Returns after at most \a timeLimit seconds.
ProbeResult runProbe(const QString& plugin, const QString& lists, int timeLimit);
