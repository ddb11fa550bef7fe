// SPDX-License-Identifier: MIT
#include "devices.h"

#include <HmiVehicle/evdevinput.h>

#include <QTextStream>

using HmiVehicle::EvdevInput;
using HmiVehicle::KeyMap;

QString useDevices(const QStringList& devices, const QString& keyMap, HmiVehicle::VehicleService& service,
                   QObject* owner)
{
    if (devices.isEmpty())
        return QString();
    KeyMap map = KeyMap::shipped();
    if (!keyMap.isEmpty() && !map.load(keyMap))
        return map.errorString();
    for (const QString& device : devices) {
        auto* const input = new EvdevInput(service, device, map, owner);
        if (!input->open())
            return input->errorString();
        QObject::connect(input, &EvdevInput::lost, [device] {
            QTextStream(stderr) << "vehicle-sim: " << device << " is lost; waiting for it\n";
        });
        QObject::connect(input, &EvdevInput::found,
                         [device] { QTextStream(stderr) << "vehicle-sim: " << device << " is back\n"; });
    }
    return QString();
}
