// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QPointer>
#include <QVariant>

#include <HmiStateMachine/PopupState>

namespace HmiGuiFramework {

/// \brief Functor that asks the view manager in the DataStore for a state's popup; connect a signal to it. GUI thread only.
class HMIGUIFRAMEWORK_EXPORT RequestPopup
{
public:
    /// \brief Keeps what to ask for; asks for nothing yet.
    RequestPopup(HmiStateMachine::PopupState* state, const QVariant& data);

    /// \brief Makes the request. Without a view manager, or when the state is gone, it gives one warning.
    void operator()() const;

private:
    QPointer<HmiStateMachine::PopupState> m_state;
    QVariant m_data;
};

} // namespace HmiGuiFramework
