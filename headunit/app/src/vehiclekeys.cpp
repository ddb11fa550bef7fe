// SPDX-License-Identifier: MIT
#include "vehiclekeys.h"

#include <HmiVehicle/controlclient.h>
#include <HmiVehicle/embeddedvehicle.h>
#include <HmiVehicle/keyinput.h>

#include <QDebug>

#include <memory>

using HmiVehicle::ControlClient;
using HmiVehicle::EmbeddedVehicle;
using HmiVehicle::KeyInput;
using HmiVehicle::Vehicle;

namespace {

/// A connection that is looked for with every key, and that is complained about once each time it is lost.
class Connection
{
public:
    explicit Connection(const QString& directory) { complainUnless(m_client.open(directory)); }

    ControlClient& client() { return m_client; }

    void complainUnless(bool reached)
    {
        if (!reached && m_reached)
            qWarning().noquote() << "The keyboard does not reach the vehicle:" << m_client.errorString();
        m_reached = reached;
    }

private:
    ControlClient m_client;
    bool m_reached = true;
};

} // namespace

Keyboard::Target keysOf(EmbeddedVehicle* vehicle)
{
    const KeyInput::Owner owner = KeyInput::newOwner();
    return {[=](int key) { vehicle->run([=](Vehicle& model) { model.keys().press(key, owner); }); },
            [=](int key) { vehicle->run([=](Vehicle& model) { model.keys().release(key, owner); }); },
            [=](int key, int steps) { vehicle->run([=](Vehicle& model) { model.keys().turn(key, steps, owner); }); }};
}

Keyboard::Target keysOf(const QString& directory)
{
    const auto vehicle = std::make_shared<Connection>(directory);
    return {[=](int key) { vehicle->complainUnless(vehicle->client().press(key)); },
            [=](int key) { vehicle->complainUnless(vehicle->client().release(key)); },
            [=](int key, int steps) { vehicle->complainUnless(vehicle->client().turn(key, steps)); }};
}
