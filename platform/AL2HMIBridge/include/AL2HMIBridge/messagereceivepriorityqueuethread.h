// SPDX-License-Identifier: MIT
#pragma once

#include "receivethread.h"

namespace AL2HMIBridge {

/// \brief Receives what must not wait behind other messages, keys and key combinations `priority`.
class AL2HMIBRIDGE_EXPORT MessageReceivePriorityQueueThread : public ReceiveThread
{
    Q_OBJECT

public:
    /// \brief Makes the process's one thread of this kind, not started, as a child of \a parent; while one lives, that one.
    static MessageReceivePriorityQueueThread* createInstance(QObject* parent);

private:
    explicit MessageReceivePriorityQueueThread(QObject* parent);
};

} // namespace AL2HMIBridge
