// SPDX-License-Identifier: MIT
#pragma once

#include "message.h"

#include <QByteArray>

namespace AL2HMIBridge {

/// Decodes one line, without its line end, that arrived on \a channel. Any thread.
///
/// On success the result is empty. Otherwise it says what is wrong and where, bounded in length, and \a message is of
/// no use. \a isJson tells whether the line is a JSON object at all.
QString decode(const QByteArray& line, BridgeEndpoint::Channel channel, Message* message, bool* isJson = nullptr);

} // namespace AL2HMIBridge
