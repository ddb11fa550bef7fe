// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QString>
#include <QVariantMap>

namespace HmiGuiFramework {

/// The colours in force, for those who draw outside QML. Safe from any thread.
namespace CurrentPalette {

void set(const QVariantMap& colors);

/// The colour of a role, or what QColor makes of \a roleOrColor ("#rrggbb"), or an invalid colour.
QColor color(const QString& roleOrColor);

} // namespace CurrentPalette
} // namespace HmiGuiFramework
