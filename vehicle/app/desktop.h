// SPDX-License-Identifier: MIT
#pragma once

#include <HmiVehicle/vehicleservice.h>

/// Uses the player and the modem of this machine, as far as they are wanted, for as long as \a owner lives, which \a service outlives. Empty, or why that
/// cannot be.
QString useDesktop(bool player, bool modem, HmiVehicle::VehicleService& service, QObject* owner);
