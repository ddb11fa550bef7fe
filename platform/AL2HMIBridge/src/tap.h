// SPDX-License-Identifier: MIT
#pragma once

#include "bridgeendpoint.h"

#include <QByteArray>

#include <functional>

namespace AL2HMIBridge {

enum class Direction { In, Out };

/// Shows a line to the recorder, if there is one. Any thread; never waits.
void tapLine(BridgeEndpoint::Channel channel, Direction direction, const QByteArray& line, bool isJson = true);

/// Who is shown the lines from now on; an empty function for nobody. After return the one before is not called any more.
using Tap = std::function<void(BridgeEndpoint::Channel, Direction, const QByteArray& line, bool isJson)>;
void setTap(Tap tap);

} // namespace AL2HMIBridge
