// SPDX-License-Identifier: MIT
#pragma once

#include "hmilogging_export.h"

#include <QString>
#include <QtGlobal>

namespace HmiLogging {

/// \brief Sends every Qt message to standard error with a monotonic timestamp and, when there is one, to a DLT daemon.
///
/// Construct one in main(), before the application object; the previous handler is restored on destruction. Messages
/// may come from any thread. Nothing here waits: a DLT daemon that is absent, slow or killed costs the caller nothing
/// and does not delay the end of the process.
class HMILOGGING_EXPORT MessageHandler
{
public:
    /// \a applicationId names the process to DLT: one to four ASCII characters, cut at four.
    explicit MessageHandler(const QString& applicationId);
    ~MessageHandler();
    Q_DISABLE_COPY(MessageHandler)

    /// \brief Whether records go to a DLT daemon (the library was found at build time and a daemon runs).
    bool dltActive() const;

    /// \brief One line as written to standard error, without the line end. \a seconds since the process's first use.
    static QString format(double seconds, QtMsgType type, const QMessageLogContext& context, const QString& message);
};

} // namespace HmiLogging
