// SPDX-License-Identifier: MIT
#include "guicategory.h"

#include <HmiLogging/HmiLoggingCategory>

namespace HmiGuiFramework {

const QLoggingCategory& guiCategory()
{
    static HmiLogging::HmiLoggingCategory category("hmi.gui", 1);
    return category;
}

} // namespace HmiGuiFramework
