// SPDX-License-Identifier: MIT
#pragma once

#include <QLoggingCategory>

namespace Zinnia {
Q_DECLARE_LOGGING_CATEGORY(zinniaLog)
} // namespace Zinnia
