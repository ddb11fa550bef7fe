// SPDX-License-Identifier: MIT
#include "identifiertype.h"

#include <HmiStateMachine/Identifier>

#include <QMetaType>

namespace HmiCore {

void registerIdentifierType()
{
    static const int id = qRegisterMetaType<HmiStateMachine::Identifier>("HmiStateMachine::Identifier");
    Q_UNUSED(id)
}

} // namespace HmiCore
