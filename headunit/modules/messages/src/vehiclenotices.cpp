// SPDX-License-Identifier: MIT
#include "vehiclenotices.h"

#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/PhoneSource>

#include <utility>

using AL2HMIBridge::BridgeConnection;
using AL2HMIBridge::GlobalSource;
using AL2HMIBridge::PhoneSource;

namespace {

constexpr double icy = 3;      ///< degrees Celsius at which a road may be icy
constexpr double notIcy = 5;   ///< from where on it is told again
constexpr int lowBattery = 15; ///< per cent
constexpr int charged = 25;    ///< from where on a low battery is told again

/// Until the vehicle has told its state, which has a time of day, its values are nobody's.
bool isKnown()
{
    return !GlobalSource::instance()->clockText().isEmpty();
}

} // namespace

VehicleNotices::VehicleNotices(QObject* parent)
    : QObject(parent)
{
    const auto* const phone = PhoneSource::instance();
    connect(phone, &PhoneSource::incomingCallChanged, this, &VehicleNotices::watchCalls);
    connect(phone, &PhoneSource::callerNameChanged, this, &VehicleNotices::watchCalls);
    connect(phone, &PhoneSource::callerNumberChanged, this, &VehicleNotices::watchCalls);
    connect(phone, &PhoneSource::callConnectedChanged, this, &VehicleNotices::watchCalls);
    connect(phone, &PhoneSource::batteryLevelChanged, this, &VehicleNotices::watchBattery);
    connect(phone, &PhoneSource::deviceNameChanged, this, &VehicleNotices::watchBattery);
    connect(GlobalSource::instance(), &GlobalSource::outsideTemperatureChanged, this, &VehicleNotices::watchCold);
    // What it tells first may be the same as nothing.
    connect(BridgeConnection::instance(), &BridgeConnection::synchronisedChanged, this, [this] {
        watchCold();
        watchBattery();
    });
}

void VehicleNotices::watchCalls()
{
    const auto* const phone = PhoneSource::instance();
    if (phone->incomingCall()) {
        m_rings = true;
        m_caller = phone->callerName();
        m_number = phone->callerNumber();
    } else if (std::exchange(m_rings, false) && !phone->callConnected() && isKnown()) {
        Message message;
        message.kind = Message::MissedCall;
        message.sender = m_caller;
        message.number = m_number;
        Q_EMIT noticed(message);
    }
}

void VehicleNotices::watchCold()
{
    const double celsius = GlobalSource::instance()->outsideTemperature();
    if (!isKnown() || celsius > notIcy)
        m_isCold = false;
    else if (celsius <= icy && !std::exchange(m_isCold, true)) {
        Message message;
        message.kind = Message::IcyRoad;
        Q_EMIT noticed(message);
    }
}

void VehicleNotices::watchBattery()
{
    const auto* const phone = PhoneSource::instance();
    const bool isThere = isKnown() && !phone->deviceName().isEmpty();
    if (!isThere || phone->batteryLevel() >= charged)
        m_isBatteryLow = false;
    else if (phone->batteryLevel() <= lowBattery && !std::exchange(m_isBatteryLow, true)) {
        Message message;
        message.kind = Message::PhoneBattery;
        message.sender = phone->deviceName();
        Q_EMIT noticed(message);
    }
}
