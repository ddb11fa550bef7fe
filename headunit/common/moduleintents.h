// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiIntentManager>

/// \brief Intents of the product and its modules beyond those that the core names. The numbers never change.
namespace ModuleIntent {
enum Id : int {
    SetTemperature = HmiCore::HmiIntentManager::UserType, ///< degrees Celsius; zone, 0 driver (if none) or 1 passenger
    AddMessage,     ///< sender, text, and if there are: telephone number, name of a place; each as text
    ShowModuleMark, ///< id of a module, and how many things wait there; 0 for none
};
}
