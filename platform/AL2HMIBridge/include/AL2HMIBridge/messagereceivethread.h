// SPDX-License-Identifier: MIT
#pragma once

#include "receivethread.h"

namespace AL2HMIBridge {

/// \brief Receives the state of the sources and their ordinary events `messages`.
class AL2HMIBRIDGE_EXPORT MessageReceiveThread : public ReceiveThread
{
    Q_OBJECT

public:
    /// \brief Makes the process's one thread of this kind, not started, as a child of \a parent; while one lives, that one.
    static MessageReceiveThread* createInstance(QObject* parent);

private:
    explicit MessageReceiveThread(QObject* parent);
};

} // namespace AL2HMIBridge
