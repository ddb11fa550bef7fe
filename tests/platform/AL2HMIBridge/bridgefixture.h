// SPDX-License-Identifier: MIT
#pragma once

#include "fakepeer.h"
#include "logcapture.h"

#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/BridgeEndpoint>
#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/MessageReceivePriorityQueueThread>
#include <AL2HMIBridge/MessageReceiveThread>
#include <AL2HMIBridge/TouchInputReceiverThread>

#include <QTest>

#include <memory>

/// A peer to connect to, threads to connect with, and the log of what they say.
class BridgeFixture
{
public:
    BridgeFixture()
    {
        AL2HMIBridge::BridgeTester::resetState();
        AL2HMIBridge::BridgeEndpoint::setDirectory(peer.directory());
    }
    ~BridgeFixture()
    {
        stop();
        QCoreApplication::sendPostedEvents();
        AL2HMIBridge::BridgeEndpoint::setDirectory(QString());
        AL2HMIBridge::BridgeEndpoint::setConnector({});
    }

    void startMessages() { (messages = AL2HMIBridge::MessageReceiveThread::createInstance(&owner))->begin(); }
    void startPriority()
    {
        (priority = AL2HMIBridge::MessageReceivePriorityQueueThread::createInstance(&owner))->begin();
    }
    void startTouch() { (touch = new AL2HMIBridge::TouchInputReceiverThread(&owner))->begin(); }

    void stop()
    {
        for (QThread* const thread : owner.findChildren<QThread*>()) {
            thread->terminate();
            thread->wait();
            delete thread;
        }
    }

    /// Everything that was sent before has been dealt with when this arrives.
    bool sendMarker(PeerSocket& socket)
    {
        ++m_marker;
        return socket.sendLine("{\"source\":\"GlobalSource\",\"state\":{\"destinationCountry\":"
                               + QByteArray::number(m_marker) + "}}")
               && QTest::qWaitFor(
                   [this] { return AL2HMIBridge::GlobalSource::instance()->destinationCountry() == m_marker; },
                   FakePeer::deadline);
    }

    QStringList takeWarnings() { return log.take(QStringLiteral("al2hmi.bridge"), QtWarningMsg); }

    static bool connected() { return AL2HMIBridge::BridgeConnection::instance()->connected(); }
    static bool synchronised() { return AL2HMIBridge::BridgeConnection::instance()->synchronised(); }

    LogCapture log;
    FakePeer peer;
    QObject owner;
    AL2HMIBridge::MessageReceiveThread* messages = nullptr;
    AL2HMIBridge::MessageReceivePriorityQueueThread* priority = nullptr;
    AL2HMIBridge::TouchInputReceiverThread* touch = nullptr;

private:
    int m_marker = 1000;
};
