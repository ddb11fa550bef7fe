// SPDX-License-Identifier: MIT
#include "messagereceivethread.h"

#include <QPointer>

namespace AL2HMIBridge {

MessageReceiveThread::MessageReceiveThread(QObject* parent)
    : ReceiveThread(BridgeEndpoint::Messages, parent)
{
}

MessageReceiveThread* MessageReceiveThread::createInstance(QObject* parent)
{
    static QPointer<MessageReceiveThread> thread;
    if (!thread)
        thread = new MessageReceiveThread(parent);
    return thread;
}

} // namespace AL2HMIBridge
