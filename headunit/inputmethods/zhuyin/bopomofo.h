// SPDX-License-Identifier: MIT
#pragma once

#include <QChar>
#include <QString>

namespace Zhuyin {

bool isTone(QChar symbol);
/// \brief The key of the library's default keyboard; 0 when this is no symbol.
char keyOf(QChar symbol);
/// \brief Whether \a symbol may come after \a symbols: initial, medial, final and tone in that order, none twice.
bool mayFollow(const QString& symbols, QChar symbol);

} // namespace Zhuyin
