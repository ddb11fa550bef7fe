// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/wire.h"
#include "connection.h"

namespace HmiVehicle {

/// An HMI on a channel, as the vehicle sees it.
Peer hmiPeer(Channel channel);
/// A panel, keyboard or script on the control socket, as the vehicle sees it.
Peer controlPeer();
/// The vehicle, as these see it.
Peer vehiclePeer();

} // namespace HmiVehicle
