// SPDX-License-Identifier: MIT
#include "themedocument.h"

#include "jsonfile.h"

#include <QColor>
#include <QJsonValue>

namespace HmiGuiFramework {

namespace {

ThemeDocument failure(const QString& field, const QString& text)
{
    ThemeDocument document;
    document.error = field + QStringLiteral(": ") + text;
    return document;
}

} // namespace

ThemeDocument ThemeDocument::read(const QString& path)
{
    const JsonFile file = JsonFile::read(path);
    if (!file.error.isEmpty()) {
        ThemeDocument document;
        document.error = file.error;
        return document;
    }
    ThemeDocument document;
    const QJsonValue palettes = file.object.value(QLatin1String("palettes"));
    if (!palettes.isObject() || palettes.toObject().isEmpty())
        return failure(QStringLiteral("palettes"), QStringLiteral("must be an object with at least one palette"));
    QStringList roles;
    const QJsonObject byName = palettes.toObject();
    for (auto palette = byName.begin(); palette != byName.end(); ++palette) {
        const QString where = QStringLiteral("palettes.") + palette.key();
        QVariantMap colors;
        const QJsonObject entries = palette.value().toObject();
        for (auto entry = entries.begin(); entry != entries.end(); ++entry) {
            const QColor color(entry.value().toString());
            if (!color.isValid())
                return failure(where + QLatin1Char('.') + entry.key(), QStringLiteral("is not a colour"));
            colors.insert(entry.key(), color);
        }
        const QStringList names = colors.keys();
        if (roles.isEmpty())
            roles = names;
        if (colors.isEmpty() || names != roles)
            return failure(where, QStringLiteral("must give a colour to the same roles as the other palettes"));
        document.palettes.insert(palette.key(), colors);
    }
    document.defaultPalette = file.object.value(QLatin1String("defaultPalette")).toString(byName.constBegin().key());
    if (!document.palettes.contains(document.defaultPalette))
        return failure(QStringLiteral("defaultPalette"),
                       QStringLiteral("there is no palette \"%1\"").arg(document.defaultPalette));
    const QJsonObject values = file.object.value(QLatin1String("values")).toObject();
    for (auto value = values.begin(); value != values.end(); ++value) {
        if (!value.value().isDouble() && !value.value().isString())
            return failure(QStringLiteral("values.") + value.key(), QStringLiteral("must be a number or a string"));
        document.values.insert(value.key(), value.value().toVariant());
    }
    return document;
}

} // namespace HmiGuiFramework
