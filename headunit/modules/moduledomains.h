// SPDX-License-Identifier: MIT
#pragma once

/// \brief Domain ids of the head unit's modules, of their submodules and of the places that host submodules.
namespace ModuleDomain {
enum Id : int {
    Radio = 10,
    Navigation = 12,
    Media = 15,
    Phone = 20,
    Climate = 25,
    Messages = 27,
    Settings = 30,
    Apps = 28,
    Sound = 31, ///< submodule of the settings module: volume and tone
};
}
