// SPDX-License-Identifier: MIT
#pragma once

#include "route.h"

#include <QString>

/// \brief How manoeuvres are shown.
namespace Manoeuvres {

QString icon(Manoeuvre manoeuvre);

/// \brief What to do, in the language of the HMI, such as "Turn left".
QString text(Manoeuvre manoeuvre);

} // namespace Manoeuvres
