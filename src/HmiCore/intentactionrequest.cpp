// SPDX-License-Identifier: MIT
#include "intentactionrequest.h"

#include "hmiintentmanager.h"

namespace HmiCore {

IntentActionRequest::IntentActionRequest(int intent, IntentActionDataProvider* provider)
    : m_intent(intent)
    , m_provider(provider)
{
}

void IntentActionRequest::operator()() const
{
    // Asked before the manager's mutex is taken: the provider may use the manager.
    const QList<QVariant> data = m_provider ? m_provider->intentData() : QList<QVariant>();
    HmiIntentManager::instance()->requestAction(m_intent, data, false, false, QVariant());
}

} // namespace HmiCore
