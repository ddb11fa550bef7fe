// SPDX-License-Identifier: MIT
#pragma once

constexpr int failed = 1;     ///< it could not be done, or was not as expected
constexpr int wrongUsage = 2; ///< the command line or a file is wrong
