// SPDX-License-Identifier: MIT
#include "dltbackend.h"

namespace HmiLogging {
namespace DltBackend {

bool start(const QByteArray&)
{
    return false;
}

void write(QtMsgType, const char*, const QString&) {}

void stop() {}

} // namespace DltBackend
} // namespace HmiLogging
