// SPDX-License-Identifier: MIT
#include "drivinglock.h"

#include <AL2HMIBridge/GlobalSource>

using AL2HMIBridge::GlobalSource;

namespace {

constexpr double locksFrom = 5;    // km/h
constexpr double unlocksBelow = 3; // km/h

} // namespace

DrivingLock::DrivingLock(QObject* parent)
    : QObject(parent)
{
    connect(GlobalSource::instance(), &GlobalSource::vehicleSpeedChanged, this, &DrivingLock::update);
    update();
}

void DrivingLock::update()
{
    const double speed = GlobalSource::instance()->vehicleSpeed();
    const bool locked = m_locked ? speed >= unlocksBelow : speed >= locksFrom;
    if (locked == m_locked)
        return;
    m_locked = locked;
    Q_EMIT lockedChanged();
}
