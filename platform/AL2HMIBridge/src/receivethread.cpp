// SPDX-License-Identifier: MIT
#include "receivethread.h"

#include "bridgeconnection.h"
#include "receiveloop.h"

namespace AL2HMIBridge {

ReceiveThread::ReceiveThread(BridgeEndpoint::Channel channel, QObject* parent)
    : QThread(parent)
    , m_channel(channel)
    , m_loop(std::make_unique<ReceiveLoop>(channel))
{
    setObjectName(BridgeEndpoint::channelName(channel));
}

ReceiveThread::~ReceiveThread()
{
    if (!m_begun)
        return;
    terminate();
    wait();
    BridgeConnection::threadEnded(m_channel);
}

void ReceiveThread::begin()
{
    m_begun = true;
    start();
}

void ReceiveThread::run()
{
    m_loop->run();
}

} // namespace AL2HMIBridge
