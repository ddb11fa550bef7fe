// SPDX-License-Identifier: MIT
#include "hmicore.h"

#include "logcategories.h"
#include "qmlloggers.h"

#include <HmiLogging/HmiLogging>
#include <HmiLogging/HmiLoggingCategory>

namespace HmiCore {

QLoggingCategory& hmicore()
{
    static HmiLogging::HmiLoggingCategory category("kest.hmicore", 1);
    return category;
}

const QLoggingCategory& decisionsLog()
{
    static const HmiLogging::HmiLoggingCategory category("kest.hmicore.decisions", 1);
    return category;
}

void installCustomLogObjects(QQmlEngine* engine)
{
    installQmlLoggers(engine, {{QStringLiteral("performanceLogger"), HmiLogging::hmiperformance()},
                               {QStringLiteral("traceLogger"), HmiLogging::hmitrace()}});
}

} // namespace HmiCore
