// SPDX-License-Identifier: MIT
#pragma once

/// \brief Domain ids of the head unit's modules, of their submodules and of the places that host submodules.
namespace ModuleDomain {
enum Id : int {
    Radio = 10,
    Phone = 20,
    Settings = 30,
    Sound = 31, ///< submodule of the settings module: volume and tone
};
}
