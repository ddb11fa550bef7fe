// SPDX-License-Identifier: MIT
#include "devices.h"

QString useDevices(const QStringList& devices, const QString&, HmiVehicle::VehicleService&, QObject*)
{
    return devices.isEmpty() ? QString() : QStringLiteral("this program was built without libevdev");
}
