// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/// How often a fault is brought about: \a few times with each run of all tests, \a many when HMI_FAULTS is "full".
inline int faultCount(int few, int many)
{
    return qEnvironmentVariable("HMI_FAULTS") == QLatin1String("full") ? many : few;
}
