// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QLoggingCategory>

QT_BEGIN_NAMESPACE
class QQmlEngine;
QT_END_NAMESPACE

/// \brief The core library of a head unit's HMI.
namespace HmiCore {

/// \brief The library's logging category, "kest.hmicore".
///
/// May be called from any thread, first call included; the category lives until the process exits.
HMICORE_EXPORT QLoggingCategory& hmicore();

/// \brief Gives QML the global objects `performanceLogger` and `traceLogger`.
///
/// Each has the methods `log`, `debug` (both debug level) and `warn` (warning level). They take any number of
/// arguments, join them with blanks and write to HmiLogging::hmiperformance() and HmiLogging::hmitrace(), with file,
/// line and function of the calling QML code as the log context. An argument that cannot be turned into text never
/// makes the caller fail. Call it once per engine, in the engine's thread, before QML is loaded.
HMICORE_EXPORT void installCustomLogObjects(QQmlEngine* engine);

/// \brief Registers the QML modules `HmiCore`, `HmiIntents` and `HmiOverrides`, version 1.0.
///
/// Call it once, in the GUI thread, before QML that imports them is loaded: HmiInitializer::registerQmlTypes() is the place.
HMICORE_EXPORT void registerTypes();

} // namespace HmiCore
