// SPDX-License-Identifier: MIT
#include "HmiVehicle/languages.h"

#include "resource.h"

#include <QJsonArray>

namespace HmiVehicle {

int languageFromLocale(const QString& locale)
{
    const QJsonArray sources =
        readResource(QStringLiteral(":/HmiVehicle/sources.json")).value(QLatin1String("sources")).toArray();
    for (const QJsonValue& source : sources) {
        const QJsonArray enumerations = source.toObject().value(QLatin1String("enums")).toArray();
        for (const QJsonValue& enumeration : enumerations) {
            const QJsonArray values = enumeration.toObject().value(QLatin1String("values")).toArray();
            for (const QJsonValue& value : values)
                if (!locale.isEmpty() && value.toObject().value(QLatin1String("locale")).toString() == locale)
                    return value.toObject().value(QLatin1String("value")).toInt();
        }
    }
    return -1;
}

} // namespace HmiVehicle
