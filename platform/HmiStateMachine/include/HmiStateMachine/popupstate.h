// SPDX-License-Identifier: MIT
#pragma once

#include "namedstate.h"

namespace HmiStateMachine {

/// \brief The state that is active while the popup of the same name is the topmost one.
///
/// Popup states live in a region of their own beside the views, so that a popup leaves the view's state alone.
class HMISTATEMACHINE_EXPORT PopupState : public NamedState
{
    Q_OBJECT

public:
    using NamedState::NamedState;
    ~PopupState() override;
};

} // namespace HmiStateMachine
