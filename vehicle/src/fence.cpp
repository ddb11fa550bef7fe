// SPDX-License-Identifier: MIT
#include "fence.h"

#include "HmiVehicle/vehicleservice.h"

#include <iterator>

namespace HmiVehicle {

namespace {

/// Twice, because what an HMI does about a line may be put off to its next turn.
constexpr Channel fences[] = {Channel::Priority, Channel::Messages, Channel::Priority, Channel::Messages};

int nextNumber()
{
    static int last = 0; // of this thread's vehicle; others have other HMIs
    last = last % 1000000000 + 1;
    return last;
}

} // namespace

Fence::Fence(VehicleService& service, int quietTime, QObject* parent)
    : QObject(parent)
    , m_service(service)
{
    connect(&service, &VehicleService::fenceReached, this, &Fence::take);
    connect(&m_quiet, &QTimer::timeout, this, [this] { Q_EMIT passed(false); });
    m_quiet.setSingleShot(true);
    m_quiet.start(quietTime);
    QTimer::singleShot(0, this, &Fence::sendNext);
}

void Fence::sendNext()
{
    m_missing = m_service.hmiCount(Channel::Messages);
    if (m_sent == int(std::size(fences)) || m_missing == 0) {
        m_quiet.stop();
        disconnect(&m_service, nullptr, this, nullptr);
        Q_EMIT passed(true);
        return;
    }
    m_number = nextNumber();
    m_service.vehicle().sendFence(fences[m_sent++], m_number);
}

void Fence::take(int number)
{
    if (number == m_number && --m_missing == 0)
        sendNext();
}

} // namespace HmiVehicle
