// SPDX-License-Identifier: MIT
#pragma once

#include "keyboard.h"

#include <QString>

namespace HmiVehicle {
class EmbeddedVehicle;
}

/// \brief The hard keys of the vehicle in this process, which must outlive the target.
Keyboard::Target keysOf(HmiVehicle::EmbeddedVehicle* vehicle);

/// \brief The hard keys of the vehicle that serves \a directory. One warning tells that it cannot be reached.
Keyboard::Target keysOf(const QString& directory);
