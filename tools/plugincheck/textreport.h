// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

struct Diagnosis;

/// \brief A diagnosis for people: the verdict in the first line, what the plugin offers, problems. Ends with a line break.
QString textReport(const Diagnosis& diagnosis);
