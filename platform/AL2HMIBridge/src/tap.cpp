// SPDX-License-Identifier: MIT
#include "tap.h"

#include <atomic>
#include <mutex>
#include <utility>

namespace AL2HMIBridge {

namespace {

std::atomic<bool> tapped{false};
std::mutex tapMutex;

Tap& currentTap()
{
    static Tap tap;
    return tap;
}

} // namespace

void tapLine(BridgeEndpoint::Channel channel, Direction direction, const QByteArray& line, bool isJson)
{
    if (!tapped)
        return;
    const std::lock_guard<std::mutex> lock(tapMutex);
    if (currentTap())
        currentTap()(channel, direction, line, isJson);
}

void setTap(Tap tap)
{
    const std::lock_guard<std::mutex> lock(tapMutex);
    tapped = bool(tap);
    currentTap() = std::move(tap);
}

} // namespace AL2HMIBridge
