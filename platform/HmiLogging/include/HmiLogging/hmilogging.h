// SPDX-License-Identifier: MIT
#pragma once

#include "hmiloggingcategory.h"

namespace HmiLogging {

/// \brief Category "hmi.trace": the milestones of a run, in more detail than the performance category.
HMILOGGING_EXPORT QLoggingCategory& hmitrace();

/// \brief Category "hmi.performance": start-up milestones and screen-transition markers that tools measure by.
HMILOGGING_EXPORT QLoggingCategory& hmiperformance();

} // namespace HmiLogging
