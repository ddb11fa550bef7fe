// SPDX-License-Identifier: MIT
#pragma once

namespace HmiCore {

/// \brief Makes properties and signal arguments that are declared as HmiStateMachine::Identifier readable at run time.
///
/// The meta-object system knows a type alias only after its name was registered. May be called any number of times.
void registerIdentifierType();

} // namespace HmiCore
