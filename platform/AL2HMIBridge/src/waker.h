// SPDX-License-Identifier: MIT
#pragma once

#include "filedescriptor.h"

namespace AL2HMIBridge {

/// Ends another thread's poll(). Any thread.
class Waker
{
public:
    Waker();

    int fd() const { return m_event.get(); }
    void wake();
    void clear(); ///< by the woken thread, before it looks at what it was woken for

private:
    FileDescriptor m_event;
};

} // namespace AL2HMIBridge
