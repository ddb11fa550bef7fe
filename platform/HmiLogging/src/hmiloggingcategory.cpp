// SPDX-License-Identifier: MIT
#include "hmiloggingcategory.h"

namespace HmiLogging {

namespace {
QtMsgType leastSevere(int level)
{
    if (level <= 0)
        return QtDebugMsg;
    return level == 1 ? QtWarningMsg : QtCriticalMsg;
}
} // namespace

HmiLoggingCategory::HmiLoggingCategory(const char* name, int level)
    : QLoggingCategory(name, leastSevere(level))
{
}

} // namespace HmiLogging
