// SPDX-License-Identifier: MIT
#include "bopomofo.h"

#include <algorithm>
#include <iterator>

namespace Zhuyin {

namespace {

enum Part { Initial, Medial, Final, Tone, None };

struct Range
{
    const char* keys; ///< of the symbol and those after it
    char16_t first;
    Part part;
};

constexpr Range ranges[] = {
    {"1qaz2wsxedcrfv5tgbyhn", u'ㄅ', Initial},
    {"8ik,9ol.0p;/-", u'ㄚ', Final},
    {"ujm", u'ㄧ', Medial},
    {"3", u'ˇ', Tone},
    {" ", u'ˉ', Tone},
    {"6", u'ˊ', Tone},
    {"4", u'ˋ', Tone},
    {"7", u'˙', Tone},
};

const Range* rangeOf(QChar symbol)
{
    const auto contains = [symbol](const Range& range) {
        return symbol.unicode() >= range.first && symbol.unicode() < range.first + int(qstrlen(range.keys));
    };
    const auto found = std::find_if(std::begin(ranges), std::end(ranges), contains);
    return found == std::end(ranges) ? nullptr : found;
}

Part partOf(QChar symbol)
{
    const Range* const range = rangeOf(symbol);
    return range ? range->part : None;
}

} // namespace

bool isTone(QChar symbol)
{
    return partOf(symbol) == Tone;
}

char keyOf(QChar symbol)
{
    const Range* const range = rangeOf(symbol);
    return range ? range->keys[symbol.unicode() - range->first] : '\0';
}

bool mayFollow(const QString& symbols, QChar symbol)
{
    const Part part = partOf(symbol);
    const bool begins = symbols.isEmpty() || isTone(symbols.back());
    return part != None && (begins ? part != Tone : partOf(symbols.back()) < part);
}

} // namespace Zhuyin
