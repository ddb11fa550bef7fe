// SPDX-License-Identifier: MIT
#pragma once

#include <QStringList>

class ElfFile;

/// \brief The symbols that a library needs and nobody has, readable; empty also when this cannot be told.
///
/// The present process stands for the head unit: what its libraries have is found. With \a handle, the library's own
/// libraries are those that it was loaded with; without, they are loaded by name.
QStringList missingSymbols(const ElfFile& library, void* handle);
