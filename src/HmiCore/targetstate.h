// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QString>

namespace HmiStateMachine {
class HmiLayeredState;
}

namespace HmiCore {

/// \brief Where a requested submodule is to be built. A plain value.
struct HMICORE_EXPORT TargetState
{
    /// \brief See the members.
    TargetState(HmiStateMachine::HmiLayeredState* state, const QString& viewName, int domain);

    HmiStateMachine::HmiLayeredState* state; ///< receives the submodule's states; not owned
    QString viewName;                        ///< prefix under which the submodule's views are loaded
    int domain;                              ///< module domain under which they are loaded
};

} // namespace HmiCore
