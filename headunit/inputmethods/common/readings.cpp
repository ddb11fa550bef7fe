// SPDX-License-Identifier: MIT
#include "readings.h"

#include <algorithm>

namespace InputMethods {

namespace {

struct ByCharacter
{
    bool operator()(const Reading& row, char16_t character) const { return row.character < character; }
    bool operator()(char16_t character, const Reading& row) const { return character < row.character; }
};

} // namespace

QStringList readingsOf(QChar character, const Reading* table, std::size_t count)
{
    QStringList found;
    const auto rows = std::equal_range(table, table + count, char16_t(character.unicode()), ByCharacter());
    for (auto row = rows.first; row != rows.second; ++row)
        found.append(QString::fromUtf16(row->syllable));
    return found;
}

} // namespace InputMethods
