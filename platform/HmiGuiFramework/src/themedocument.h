// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QString>
#include <QVariantMap>

namespace HmiGuiFramework {

/// A theme: palettes of colours by role, and values (sizes, fonts, durations) by name.
struct ThemeDocument
{
    /// Reads a theme document. With \ref error set, which names the field, nothing else is.
    static ThemeDocument read(const QString& path);

    QHash<QString, QVariantMap> palettes; ///< colours as QColor, by palette and role
    QString defaultPalette;
    QVariantMap values;
    QString error;
};

} // namespace HmiGuiFramework
