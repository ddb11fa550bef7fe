// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"
#include "intentactiondataprovider.h"

#include <QPointer>

namespace HmiCore {

/// \brief A request for an intent whose data is asked for when it is made, such as for the item selected by then.
///
/// A value; copy it freely. The provider is not owned and may go before the request. The thread of the provider.
class HMICORE_EXPORT IntentActionRequest
{
public:
    /// \brief Without a \a provider (null) requests have no data.
    IntentActionRequest(int intent, IntentActionDataProvider* provider);

    /// \brief Requests the intent, not exclusive; the signals of HmiIntentManager tell what came of it.
    void operator()() const;

private:
    int m_intent;
    QPointer<IntentActionDataProvider> m_provider;
};

} // namespace HmiCore
