// SPDX-License-Identifier: MIT
#pragma once

#include "bridgeendpoint.h"

#include <QElapsedTimer>

namespace AL2HMIBridge {

/// Reports refused lines, one warning each; from the hundredth in a second on they are counted instead.
class Refusals
{
public:
    explicit Refusals(BridgeEndpoint::Channel channel);
    ~Refusals();
    Q_DISABLE_COPY(Refusals)

    void report(const QString& problem);

private:
    void reportRest();

    BridgeEndpoint::Channel m_channel;
    QElapsedTimer m_second;
    int m_reported = 0;
    int m_unreported = 0;
};

} // namespace AL2HMIBridge
