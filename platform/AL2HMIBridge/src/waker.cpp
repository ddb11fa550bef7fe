// SPDX-License-Identifier: MIT
#include "waker.h"

#include <cstdint>
#include <sys/eventfd.h>

namespace AL2HMIBridge {

Waker::Waker()
    : m_event(::eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK))
{
}

void Waker::wake()
{
    const std::uint64_t one = 1;
    [[maybe_unused]] const auto written = ::write(m_event.get(), &one, sizeof one); // full means woken already
}

void Waker::clear()
{
    std::uint64_t count = 0;
    [[maybe_unused]] const auto read = ::read(m_event.get(), &count, sizeof count); // empty means cleared already
}

} // namespace AL2HMIBridge
