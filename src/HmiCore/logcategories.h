// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore.h"

#include <HmiLogging/HmiLogging>

#include <QDebug>

namespace HmiCore {

// The categories in the form that the logging macros of Qt 5 and Qt 6 both take: a function that returns a constant.

inline const QLoggingCategory& coreLog()
{
    return hmicore();
}

inline const QLoggingCategory& performanceLog()
{
    return HmiLogging::hmiperformance();
}

inline const QLoggingCategory& traceLog()
{
    return HmiLogging::hmitrace();
}

/// What was decided for keys and intents, and why; off unless a rule switches it on.
const QLoggingCategory& decisionsLog();

} // namespace HmiCore
