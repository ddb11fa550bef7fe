// SPDX-License-Identifier: MIT
#pragma once

#include <HmiVehicle/vehiclecontrol.h>
#include <HmiVehicle/vehicledirectory.h>
#include <HmiVehicle/vehicleservice.h>

/// A vehicle that serves a directory.
class Server
{
public:
    explicit Server(const HmiVehicle::Vehicle::Options& options);

    /// False when it cannot; errorString() says why.
    bool listen(const QString& directory);
    HmiVehicle::VehicleService& service() { return m_service; }
    QString errorString() const { return m_directory.errorString(); }

private:
    HmiVehicle::VehicleService m_service;
    HmiVehicle::VehicleControl m_control;
    HmiVehicle::VehicleDirectory m_directory;
};
