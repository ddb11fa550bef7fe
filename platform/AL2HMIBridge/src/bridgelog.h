// SPDX-License-Identifier: MIT
#pragma once

#include <QLoggingCategory>
#include <QString>

namespace AL2HMIBridge {

Q_DECLARE_LOGGING_CATEGORY(bridgeLog)

/// Outside text as it may stand in a log line: bounded, control characters replaced.
QString shown(const QString& text);

} // namespace AL2HMIBridge
