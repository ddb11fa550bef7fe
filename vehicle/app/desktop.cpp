// SPDX-License-Identifier: MIT
#include "desktop.h"

#include <HmiVehicle/desktopplayer.h>
#include <HmiVehicle/modemphone.h>

using HmiVehicle::DesktopPlayer;
using HmiVehicle::ModemPhone;

QString useDesktop(bool player, bool modem, HmiVehicle::VehicleService& service, QObject* owner)
{
    if (player) {
        const QDBusConnection bus = QDBusConnection::sessionBus();
        if (!bus.isConnected())
            return QStringLiteral("there is no session bus");
        new DesktopPlayer(bus, service, owner);
    }
    if (modem) {
        const QDBusConnection bus = QDBusConnection::systemBus();
        if (!bus.isConnected())
            return QStringLiteral("there is no system bus");
        new ModemPhone(bus, service, owner);
    }
    return QString();
}
