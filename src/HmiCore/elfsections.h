// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

namespace HmiCore {

/// Whether a file is a library whose table of sections, and all that it points to, is inside of the file.
///
/// Qt 5 looks for the metadata of plugins in that table, believes what it says, and reads anywhere when it is damaged.
bool hasSoundSections(const QString& path);

} // namespace HmiCore
