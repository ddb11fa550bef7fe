// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>

#include <vector>

namespace HmiVehicle {

/// One way in which a list of lines is not another: rows of both, -1 where there is none.
struct Difference
{
    int expected; ///< missing, or what was changed
    int actual;   ///< extra, or what it was changed to
};

/// The fewest differences that keep the order. Very different long lists are compared row by row.
std::vector<Difference> differencesOf(const std::vector<QByteArray>& expected, const std::vector<QByteArray>& actual);

} // namespace HmiVehicle
