// SPDX-License-Identifier: MIT
#include "targetstate.h"

namespace HmiCore {

TargetState::TargetState(HmiStateMachine::HmiLayeredState* targetState, const QString& targetViewName, int targetDomain)
    : state(targetState)
    , viewName(targetViewName)
    , domain(targetDomain)
{
}

} // namespace HmiCore
