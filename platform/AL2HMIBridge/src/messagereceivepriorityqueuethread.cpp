// SPDX-License-Identifier: MIT
#include "messagereceivepriorityqueuethread.h"

#include <QPointer>

namespace AL2HMIBridge {

MessageReceivePriorityQueueThread::MessageReceivePriorityQueueThread(QObject* parent)
    : ReceiveThread(BridgeEndpoint::Priority, parent)
{
}

MessageReceivePriorityQueueThread* MessageReceivePriorityQueueThread::createInstance(QObject* parent)
{
    static QPointer<MessageReceivePriorityQueueThread> thread;
    if (!thread)
        thread = new MessageReceivePriorityQueueThread(parent);
    return thread;
}

} // namespace AL2HMIBridge
