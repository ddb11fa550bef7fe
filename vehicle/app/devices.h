// SPDX-License-Identifier: MIT
#pragma once

#include <HmiVehicle/vehicleservice.h>

#include <QStringList>

/// Makes hard keys of input devices, for as long as \a owner lives, which \a service outlives. Empty, or why one of them cannot be used.
QString useDevices(const QStringList& devices, const QString& keyMap, HmiVehicle::VehicleService& service,
                   QObject* owner);
