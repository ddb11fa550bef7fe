// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/// \brief The kinds of places that one drives to.
namespace PlaceCategories {

struct Category
{
    const char* id; ///< as in Town; empty for all
    const char* icon;
    const char* text; ///< in English
};

int count();
const Category& at(int row);

/// \brief The category of this id; that of all when there is none.
const Category& find(const QString& id);

/// \brief Its name in the language of the HMI.
QString name(const Category& category);

} // namespace PlaceCategories
