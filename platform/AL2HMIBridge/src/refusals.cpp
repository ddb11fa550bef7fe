// SPDX-License-Identifier: MIT
#include "refusals.h"

#include "bridgelog.h"
#include "bridgelimits.h"

namespace AL2HMIBridge {

Refusals::Refusals(BridgeEndpoint::Channel channel)
    : m_channel(channel)
{
    m_second.start();
}

Refusals::~Refusals()
{
    reportRest();
}

void Refusals::report(const QString& problem)
{
    if (m_second.elapsed() >= 1000) {
        reportRest();
        m_reported = 0;
        m_second.restart();
    }
    if (m_reported == refusalBurst) {
        ++m_unreported;
        return;
    }
    ++m_reported;
    qCWarning(bridgeLog).noquote() << "Line refused on" << BridgeEndpoint::channelName(m_channel) + QLatin1Char(':')
                                   << problem;
}

void Refusals::reportRest()
{
    if (!m_unreported)
        return;
    qCWarning(bridgeLog).noquote() << "Lines refused on" << BridgeEndpoint::channelName(m_channel) + QLatin1Char(':')
                                   << m_unreported << "more within a second";
    m_unreported = 0;
}

} // namespace AL2HMIBridge
