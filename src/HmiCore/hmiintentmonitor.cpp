// SPDX-License-Identifier: MIT
#include "hmiintentmonitor.h"

#include "hmiintenthandler.h"

namespace HmiCore {

HmiIntentMonitor::HmiIntentMonitor(int intent, const QList<QPointer<HmiIntentHandler>>& handlers, QObject* parent)
    : QObject(parent)
    , m_intent(intent)
{
    for (const QPointer<HmiIntentHandler>& handler : handlers) {
        if (!handler)
            continue;
        connect(handler, &HmiIntentHandler::actionStatusChanged, this, &HmiIntentMonitor::actionStatusChanged);
        // By its address only: what is being destroyed is no handler any more.
        connect(handler, &QObject::destroyed, this, [this, gone = handler.data()] { disable(gone); });
        if (handler->isActionEnabled(intent))
            m_enabledHandlers.append(handler);
    }
}

HmiIntentMonitor::~HmiIntentMonitor() = default;

void HmiIntentMonitor::actionStatusChanged(int intent, bool enabled)
{
    auto* const handler = qobject_cast<HmiIntentHandler*>(sender());
    if (intent != m_intent || !handler)
        return;
    if (!enabled)
        return disable(handler);
    if (m_enabledHandlers.contains(handler))
        return;
    m_enabledHandlers.append(handler);
    if (m_enabledHandlers.size() == 1)
        Q_EMIT enabledChanged(true);
}

void HmiIntentMonitor::disable(HmiIntentHandler* handler)
{
    if (m_enabledHandlers.removeAll(handler) > 0 && m_enabledHandlers.isEmpty())
        Q_EMIT enabledChanged(false);
}

} // namespace HmiCore
