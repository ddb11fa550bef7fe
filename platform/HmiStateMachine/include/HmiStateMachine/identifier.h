// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

namespace HmiStateMachine {

/// \brief Name of a state, unique in the state tree; parts are separated by dots, such as "RADIO.Main".
typedef QString Identifier;

} // namespace HmiStateMachine
