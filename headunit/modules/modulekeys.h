// SPDX-License-Identifier: MIT
#pragma once

/// \brief Hard keys of the front panel that lead to modules; see vehicle/data/keys.json.
namespace ModuleKey {
enum Id : int {
    Navigation = 100,
    Climate = 101,
    Messages = 102,
    Apps = 103,
    Defrost = 104,
    WarmerDriver = 105,
    CoolerDriver = 106,
};
}
