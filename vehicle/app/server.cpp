// SPDX-License-Identifier: MIT
#include "server.h"

using HmiVehicle::VehicleControl;
using HmiVehicle::VehicleDirectory;
using HmiVehicle::VehicleService;

Server::Server(const HmiVehicle::Vehicle::Options& options)
    : m_service(options)
    , m_control(m_service)
{
    QObject::connect(&m_directory, &VehicleDirectory::connected, &m_service, &VehicleService::addConnection);
    QObject::connect(&m_directory, &VehicleDirectory::controlConnected, &m_control, &VehicleControl::addConnection);
}

bool Server::listen(const QString& directory)
{
    return m_directory.listen(directory);
}
