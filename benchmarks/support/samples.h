// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

/// How long an operation took, once for each repetition, in microseconds. There is at least one.
class Samples
{
public:
    Samples(std::vector<double> values) // NOLINT(google-explicit-constructor): a list of times is one
        : m_sorted(std::move(values))
    {
        std::sort(m_sorted.begin(), m_sorted.end());
    }

    double median() const { return m_sorted.at(count() / 2); }
    std::size_t count() const { return m_sorted.size(); }

    /// Half the distance between the quartiles, as a part of the median.
    double spread() const
    {
        const double median = this->median();
        return median > 0 ? (m_sorted.at(count() * 3 / 4) - m_sorted.at(count() / 4)) / 2 / median : 0;
    }

    /// Times \a factor, plus \a offset.
    Samples scaled(double factor, double offset = 0) const
    {
        std::vector<double> values = m_sorted;
        for (double& value : values)
            value = value * factor + offset;
        return values;
    }

private:
    std::vector<double> m_sorted;
};
