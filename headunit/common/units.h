// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QVariant>

/// \brief Quantities as the vehicle's market and the driver's language write them. GUI thread only.
///
/// Ask again when GlobalSource::destinationCountryChanged() or HmiManager::hmiRetranslated() is emitted.
namespace Units {

/// \brief A property of the market that the vehicle is made for.
QVariant marketProperty(const char* name);

/// \brief Whether the market measures temperatures in degrees Fahrenheit.
bool isFahrenheit();

/// \brief A number with \a decimals digits after the language's decimal point.
QString number(double value, int decimals);

/// \brief A way to go, rounded as one says it: \a metres in metres and kilometres, or in feet or yards and miles.
QString distance(double metres);

/// \brief A time to wait, in minutes and hours; at least one minute.
QString duration(double seconds);

} // namespace Units
