// SPDX-License-Identifier: MIT
#include "receivethread.h"

#include "receiveloop.h"

namespace AL2HMIBridge {

ReceiveThread::ReceiveThread(BridgeEndpoint::Channel channel, QObject* parent)
    : QThread(parent)
    , m_loop(std::make_unique<ReceiveLoop>(channel))
{
    setObjectName(BridgeEndpoint::channelName(channel));
}

ReceiveThread::~ReceiveThread()
{
    terminate();
    wait();
}

void ReceiveThread::begin()
{
    start();
}

void ReceiveThread::run()
{
    m_loop->run();
}

} // namespace AL2HMIBridge
