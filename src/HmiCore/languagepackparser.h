// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"
#include "hmilanguagepackcollection.h"

namespace HmiCore {

/// \brief Reads the configuration of language bundles.
class HMICORE_EXPORT LanguagePackParser
{
public:
    /// \brief The bundles of a file by their ids; none, after a warning, when it is missing or damaged.
    ///
    /// Elements without an id or without locales are skipped; of elements with the same id the last one counts. Only the first
    /// element that says whether it is the fallback is believed.
    QMap<QString, HmiLanguagePackCollection::LanguageBundle> parse(const QString& fileName, const QString& directory);
};

} // namespace HmiCore
