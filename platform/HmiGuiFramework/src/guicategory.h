// SPDX-License-Identifier: MIT
#pragma once

#include <QLoggingCategory>

namespace HmiGuiFramework {

/// Category "hmi.gui": what the framework refuses or cannot do.
const QLoggingCategory& guiCategory();

} // namespace HmiGuiFramework
