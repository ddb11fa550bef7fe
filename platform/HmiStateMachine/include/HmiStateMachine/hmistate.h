// SPDX-License-Identifier: MIT
#pragma once

#include "namedstate.h"

namespace HmiStateMachine {

/// \brief A state of the HMI's view hierarchy: a module's root, a screen, or a group of screens.
class HMISTATEMACHINE_EXPORT HmiState : public NamedState
{
    Q_OBJECT

public:
    using NamedState::NamedState;
    ~HmiState() override;
};

} // namespace HmiStateMachine
