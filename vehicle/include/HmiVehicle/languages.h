// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

namespace HmiVehicle {

/// \brief The protocol's number of the language with exactly this locale name, such as de_DE; -1 for an unknown one.
int languageFromLocale(const QString& locale);

} // namespace HmiVehicle
