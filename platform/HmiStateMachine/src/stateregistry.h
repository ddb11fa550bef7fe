// SPDX-License-Identifier: MIT
#pragma once

#include <QMultiHash>
#include <QString>

namespace HmiStateMachine {

class NamedState;

/// All named states of the process, of every machine and of none: a state is made before it joins a machine.
QMultiHash<QString, NamedState*>& stateRegistry();

} // namespace HmiStateMachine
