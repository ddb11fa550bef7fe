// SPDX-License-Identifier: MIT
#pragma once

#include "sourceinfo.h"

#include <QJsonValue>

namespace AL2HMIBridge {

/// Turns a JSON value into what \a shape asks for. The result is empty, or says what is wrong with the value.
QString decodeValue(const QJsonValue& json, const ValueShape& shape, Value* value);

} // namespace AL2HMIBridge
