// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"
#include "bridgeendpoint.h"

#include <QThread>

#include <memory>

namespace AL2HMIBridge {

class ReceiveLoop;

/// \brief A thread that connects one channel to the application layer, and again whenever the peer is lost.
///
/// It decodes what arrives; what it means reaches the sources in the thread that made this object, which runs an event
/// loop (the GUI thread). It never finishes by itself: terminate() it, at any moment, and wait(). It dies only while it
/// waits for input, so that no lock and no half message is left. The destructor does the same when nobody did.
class AL2HMIBRIDGE_EXPORT ReceiveThread : public QThread
{
    Q_OBJECT

public:
    ~ReceiveThread() override;

    /// \brief Starts the thread; nothing happens when it runs already.
    void begin();

protected:
    ReceiveThread(BridgeEndpoint::Channel channel, QObject* parent);
    void run() override;

private:
    const BridgeEndpoint::Channel m_channel;
    bool m_begun = false;
    std::unique_ptr<ReceiveLoop> m_loop;
};

} // namespace AL2HMIBridge
