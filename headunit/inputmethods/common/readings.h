// SPDX-License-Identifier: MIT
#pragma once

#include <QChar>
#include <QStringList>

#include <cstddef>

namespace InputMethods {

/// \brief How a character is read in Mandarin, as it is typed on some keyboard; a row of the tables that makereadings.py writes.
struct Reading
{
    char16_t character;
    char16_t syllable[7];
};

/// \brief The readings of \a character in a table of \a count rows, the most usual first; empty when it is no Chinese character.
QStringList readingsOf(QChar character, const Reading* table, std::size_t count);

} // namespace InputMethods
