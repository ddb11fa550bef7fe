// SPDX-License-Identifier: MIT
#pragma once

#include "expectedkeycalls.h"

/// Lets the sources say what makes \a world different from the one \a before; false when they refuse.
bool showKeyWorld(const KeyWorld& world, const KeyWorld& before);
