// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QString>

class StartupTimeline;

/// \brief A start-up in the forms in which people look at it.
namespace StartupFormats {

/// A picture, SVG: a bar per phase on a common scale of milliseconds, and thin bars for steps.
QByteArray picture(const StartupTimeline& timeline);

/// JSON of complete events, in the trace event format that the trace viewers of browsers open.
QByteArray trace(const StartupTimeline& timeline);

/// A table for a terminal.
QString table(const StartupTimeline& timeline);

} // namespace StartupFormats
