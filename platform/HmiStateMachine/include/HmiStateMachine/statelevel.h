// SPDX-License-Identifier: MIT
#pragma once

namespace HmiStateMachine {

/// \brief Level of the state tree that a transition or popup belongs to.
enum StateLevel : int {
    ViewLevel = 0,   ///< views of modules
    PopupLevel = 1,  ///< popups of modules
    SystemLevel = 2, ///< popups of the system, above those of modules
};

} // namespace HmiStateMachine
