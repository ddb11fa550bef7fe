// SPDX-License-Identifier: MIT
#pragma once

#include "bridgeendpoint.h"

#include <QJsonArray>
#include <QString>

#include <functional>

namespace AL2HMIBridge {

/// Encodes a call and hands it to the channel's link; false after a warning when it had to be dropped.
bool sendCall(BridgeEndpoint::Channel channel, const QString& source, const QString& call, const QJsonArray& arguments);

/// Takes calls in place of the links; an empty function gives them back. GUI thread only.
using CallReceiver = std::function<void(const QString& source, const QString& call, const QJsonArray& arguments)>;
void divertCalls(CallReceiver receiver);

} // namespace AL2HMIBridge
