// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

class QByteArray;
class QString;

namespace HmiLogging {
namespace DltBackend {

/// Registers the process with the DLT daemon. False when there is no daemon or the library was built without DLT.
bool start(const QByteArray& applicationId);

/// Hands one record over without waiting. Only after start() returned true.
void write(QtMsgType type, const char* category, const QString& message);

/// Unregisters at once; records that the daemon did not take are dropped.
void stop();

} // namespace DltBackend
} // namespace HmiLogging
