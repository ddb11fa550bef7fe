// SPDX-License-Identifier: MIT
#include "HmiVehicle/vehiclecontrol.h"

#include "HmiVehicle/vehicleservice.h"
#include "calllog.h"
#include "controlsession.h"
#include "peers.h"

#include <unistd.h>

namespace HmiVehicle {

namespace {
constexpr int maximumClients = 16;
} // namespace

VehicleControl::VehicleControl(VehicleService& service, QObject* parent)
    : QObject(parent)
    , m_service(service)
    , m_calls(std::make_unique<CallLog>())
{
    connect(&service, &VehicleService::called, m_calls.get(), &CallLog::add);
}

VehicleControl::~VehicleControl()
{
    qDeleteAll(findChildren<ControlSession*>()); // before what they use
}

void VehicleControl::addConnection(int socket)
{
    if (findChildren<ControlSession*>().size() >= maximumClients) {
        ::close(socket);
        return;
    }
    new ControlSession(new Connection(socket, controlPeer(), nullptr), m_service, *m_calls, this);
}

} // namespace HmiVehicle
