// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QVariant>

namespace HmiCore {

/// \brief A request for an intent that is ready to be made, for a key or a menu entry. Made of values; copy it freely.
class HMICORE_EXPORT HmiIntentRequest
{
public:
    /// \brief The arguments of HmiIntentManager::requestAction().
    HmiIntentRequest(int intent, const QList<QVariant>& data, bool exclusive, bool vrEvent,
                     const QVariant& vrEventData);
    /// \brief Without data, and not exclusive.
    HmiIntentRequest(int intent, bool vrEvent, const QVariant& vrEventData);

    /// \brief Makes a new request; whether a handler performed it.
    bool operator()() const;

private:
    int m_intent;
    QList<QVariant> m_data;
    bool m_exclusive;
    bool m_vrEvent;
    QVariant m_vrEventData;
};

} // namespace HmiCore
