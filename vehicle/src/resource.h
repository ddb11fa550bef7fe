// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>

namespace HmiVehicle {

/// The JSON object in a file that is built in; ends the program when it is not there.
QJsonObject readResource(const QString& fileName);

} // namespace HmiVehicle
