// SPDX-License-Identifier: MIT
#pragma once

#include "hmilogging_export.h"

#include <QLoggingCategory>

namespace HmiLogging {

/// \brief A logging category whose default verbosity is given as a number.
///
/// \a level is the least severe message that is on by default: 0 debug, 1 warning, 2 critical; values outside are
/// treated as the nearest of these. `QT_LOGGING_RULES`, `QLoggingCategory::setFilterRules()` and a DLT daemon's
/// level requests override the default at run time. Reading a category is safe from any thread.
class HMILOGGING_EXPORT HmiLoggingCategory : public QLoggingCategory
{
public:
    /// \a name must stay valid for the life of the category, as for QLoggingCategory.
    HmiLoggingCategory(const char* name, int level);
    ~HmiLoggingCategory() = default;
};

} // namespace HmiLogging
