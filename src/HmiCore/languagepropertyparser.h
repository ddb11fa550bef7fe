// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QHash>
#include <QMap>
#include <QPair>
#include <QString>
#include <QVariant>

namespace HmiCore {

/// \brief Reads the properties of languages.
class HMICORE_EXPORT LanguagePropertyParser
{
public:
    /// \brief The properties in a file, by bundle and locale; none, after a warning, when it is missing or damaged.
    ///
    /// Elements without a bundle, a locale or properties are skipped; of elements for the same pair the last one counts.
    QHash<QPair<QString, QString>, QMap<QString, QVariant>> parse(const QString& fileName, const QString& directory);
};

} // namespace HmiCore
