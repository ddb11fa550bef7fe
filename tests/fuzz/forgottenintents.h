// SPDX-License-Identifier: MIT
#pragma once

namespace Fuzzing {

/// Takes all handlers and monitors out of the intent manager, which is one for the process and would keep those of all inputs.
void forgetIntents();

} // namespace Fuzzing
