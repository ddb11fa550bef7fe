// SPDX-License-Identifier: MIT
#include "placecategories.h"

#include <QCoreApplication>

#include <iterator>

namespace PlaceCategories {

namespace {

const Category categories[] = {{"", "list", QT_TRANSLATE_NOOP("PlaceCategories", "All places")},
                               {"home", "home", QT_TRANSLATE_NOOP("PlaceCategories", "Home")},
                               {"work", "work", QT_TRANSLATE_NOOP("PlaceCategories", "Work")},
                               {"fuel", "fuel", QT_TRANSLATE_NOOP("PlaceCategories", "Fuel")},
                               {"charging", "charging", QT_TRANSLATE_NOOP("PlaceCategories", "Charging")},
                               {"parking", "parking", QT_TRANSLATE_NOOP("PlaceCategories", "Parking")},
                               {"food", "food", QT_TRANSLATE_NOOP("PlaceCategories", "Eating")},
                               {"sight", "star", QT_TRANSLATE_NOOP("PlaceCategories", "Sights")},
                               {"health", "health", QT_TRANSLATE_NOOP("PlaceCategories", "Health")},
                               {"transport", "transport", QT_TRANSLATE_NOOP("PlaceCategories", "Train and ferry")}};

} // namespace

int count()
{
    return int(std::size(categories));
}

const Category& at(int row)
{
    return categories[row];
}

const Category& find(const QString& id)
{
    for (const Category& category : categories)
        if (id == QLatin1String(category.id))
            return category;
    return categories[0];
}

QString name(const Category& category)
{
    return QCoreApplication::translate("PlaceCategories", category.text);
}

} // namespace PlaceCategories
