// SPDX-License-Identifier: MIT
#include "hmilogging.h"

namespace HmiLogging {

QLoggingCategory& hmitrace()
{
    static HmiLoggingCategory category("hmi.trace", 1);
    return category;
}

QLoggingCategory& hmiperformance()
{
    static HmiLoggingCategory category("hmi.performance", 1);
    return category;
}

} // namespace HmiLogging
