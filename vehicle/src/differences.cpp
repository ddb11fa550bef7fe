// SPDX-License-Identifier: MIT
#include "differences.h"

#include <algorithm>

namespace HmiVehicle {

namespace {

constexpr size_t largestTable = 16 * 1024 * 1024;

using Lines = std::vector<QByteArray>;

/// The part of two lists that is not the same at both ends.
struct Middle
{
    size_t begin;
    size_t expectedEnd;
    size_t actualEnd;

    size_t expectedSize() const { return expectedEnd - begin; }
    size_t actualSize() const { return actualEnd - begin; }
};

Middle middleOf(const Lines& expected, const Lines& actual)
{
    Middle middle{0, expected.size(), actual.size()};
    while (middle.begin < middle.expectedEnd && middle.begin < middle.actualEnd
           && expected[middle.begin] == actual[middle.begin])
        ++middle.begin;
    while (middle.expectedEnd > middle.begin && middle.actualEnd > middle.begin
           && expected[middle.expectedEnd - 1] == actual[middle.actualEnd - 1]) {
        --middle.expectedEnd;
        --middle.actualEnd;
    }
    return middle;
}

/// Lengths of the longest common rests, one row and column more than there are lines.
std::vector<int> commonRests(const Lines& expected, const Lines& actual, const Middle& middle)
{
    const size_t width = middle.actualSize() + 1;
    std::vector<int> table(width * (middle.expectedSize() + 1), 0);
    for (size_t row = middle.expectedSize(); row-- > 0;)
        for (size_t column = middle.actualSize(); column-- > 0;)
            table[row * width + column] =
                expected[middle.begin + row] == actual[middle.begin + column]
                    ? table[(row + 1) * width + column + 1] + 1
                    : std::max(table[(row + 1) * width + column], table[row * width + column + 1]);
    return table;
}

std::vector<Difference> rowByRow(const Lines& expected, const Lines& actual, const Middle& middle)
{
    std::vector<Difference> differences;
    for (size_t i = middle.begin; i < std::max(middle.expectedEnd, middle.actualEnd); ++i) {
        const bool isExpected = i < middle.expectedEnd;
        const bool isActual = i < middle.actualEnd;
        if (!isExpected || !isActual || expected[i] != actual[i])
            differences.push_back({isExpected ? int(i) : -1, isActual ? int(i) : -1});
    }
    return differences;
}

/// A line that is missing where another is extra was changed.
std::vector<Difference> paired(const std::vector<Difference>& differences)
{
    std::vector<Difference> result;
    size_t open = 0; ///< first of the missing ones that may have been changed
    for (size_t i = 0; i < differences.size(); ++i) {
        const Difference& difference = differences[i];
        const bool isBreak = difference.expected < 0 && difference.actual < 0; // lines that are the same
        if (isBreak) {
            open = result.size();
            continue;
        }
        while (open < result.size() && result[open].actual >= 0)
            ++open;
        if (difference.expected < 0 && open < result.size())
            result[open].actual = difference.actual;
        else
            result.push_back(difference);
    }
    return result;
}

} // namespace

std::vector<Difference> differencesOf(const Lines& expected, const Lines& actual)
{
    const Middle middle = middleOf(expected, actual);
    if ((middle.expectedSize() + 1) * (middle.actualSize() + 1) > largestTable)
        return rowByRow(expected, actual, middle);
    const std::vector<int> table = commonRests(expected, actual, middle);
    const size_t width = middle.actualSize() + 1;
    std::vector<Difference> differences;
    size_t row = 0;
    size_t column = 0;
    while (row < middle.expectedSize() || column < middle.actualSize()) {
        const bool rowLeft = row < middle.expectedSize();
        const bool columnLeft = column < middle.actualSize();
        if (rowLeft && columnLeft && expected[middle.begin + row] == actual[middle.begin + column]) {
            differences.push_back({-1, -1});
            ++row;
            ++column;
        } else if (rowLeft && (!columnLeft || table[(row + 1) * width + column] >= table[row * width + column + 1])) {
            differences.push_back({int(middle.begin + row++), -1});
        } else {
            differences.push_back({-1, int(middle.begin + column++)});
        }
    }
    return paired(differences);
}

} // namespace HmiVehicle
