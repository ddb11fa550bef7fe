// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

#include <memory>

namespace HmiVehicle {

class CallLog;
class VehicleService;

/// \brief Lets scripts, panels and keyboards of other processes reach a vehicle. Needs the event loop of its thread.
///
/// Each client is an owner of keys, and loses them when its connection ends. What a client can ask for is listed by
/// `vehicle-sim --help`; docs/vehicle.md has the lines.
class VehicleControl : public QObject
{
    Q_OBJECT

public:
    /// \brief \a service must outlive this.
    explicit VehicleControl(VehicleService& service, QObject* parent = nullptr);
    ~VehicleControl() override;

    /// \brief Serves a client on a connected stream socket, which it owns then. More than sixteen are refused.
    void addConnection(int socket);

private:
    VehicleService& m_service;
    std::unique_ptr<CallLog> m_calls;
};

} // namespace HmiVehicle
