// SPDX-License-Identifier: MIT
#include "hmiintentrequest.h"

#include "hmiintentmanager.h"

namespace HmiCore {

HmiIntentRequest::HmiIntentRequest(int intent, const QList<QVariant>& data, bool exclusive, bool vrEvent,
                                   const QVariant& vrEventData)
    : m_intent(intent)
    , m_data(data)
    , m_exclusive(exclusive)
    , m_vrEvent(vrEvent)
    , m_vrEventData(vrEventData)
{
}

HmiIntentRequest::HmiIntentRequest(int intent, bool vrEvent, const QVariant& vrEventData)
    : HmiIntentRequest(intent, QList<QVariant>(), false, vrEvent, vrEventData)
{
}

bool HmiIntentRequest::operator()() const
{
    return HmiIntentManager::instance()->requestAction(m_intent, m_data, m_exclusive, m_vrEvent, m_vrEventData);
}

} // namespace HmiCore
