// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/vehicle.h"

#include <QString>

#include <functional>
#include <memory>

namespace HmiVehicle {

class VehicleService;

/// \brief A vehicle in a thread of its own, connected over socket pairs to an HMI in the same process.
///
/// Hand connectChannel() to the HMI's side as what makes its connections. All functions are thread-safe, except that
/// start() and stop() must not run at the same time as each other.
class EmbeddedVehicle
{
public:
    explicit EmbeddedVehicle(const Vehicle::Options& options = Vehicle::Options());
    /// \brief Stops.
    ~EmbeddedVehicle();
    EmbeddedVehicle(const EmbeddedVehicle&) = delete;
    EmbeddedVehicle& operator=(const EmbeddedVehicle&) = delete;

    /// \brief Starts a new vehicle, in the state that every vehicle starts in. Nothing happens when one runs.
    void start();
    /// \brief Ends it as when its process died: all connections are cut.
    void stop();
    bool isRunning() const;

    /// \brief A new connection to \a channel ("messages", "priority" or "touch"); the caller owns the socket.
    ///
    /// -1 when the vehicle does not run, the channel is unknown or the system refuses. Does not wait.
    int connectChannel(const QString& channel);

    /// \brief Lets \a action happen to the vehicle, in its thread, soon. Nothing happens when it does not run.
    void run(std::function<void(Vehicle& vehicle)> action);

    /// \brief As run(), for who connects to the service's signals; it lives until stop().
    void runInService(std::function<void(VehicleService& service)> action);

private:
    struct Running;

    Vehicle::Options m_options;
    std::unique_ptr<Running> m_running;
};

} // namespace HmiVehicle
