// SPDX-License-Identifier: MIT
#include "desktop.h"

QString useDesktop(bool player, bool modem, HmiVehicle::VehicleService&, QObject*)
{
    return player || modem ? QStringLiteral("this program was built without D-Bus") : QString();
}
