// SPDX-License-Identifier: MIT
#include "currentpalette.h"

#include <mutex>

namespace HmiGuiFramework {
namespace CurrentPalette {

namespace {
std::mutex mutex;

QVariantMap& colorsInForce()
{
    static QVariantMap colors;
    return colors;
}
} // namespace

void set(const QVariantMap& colors)
{
    const std::lock_guard<std::mutex> lock(mutex);
    colorsInForce() = colors;
}

QColor color(const QString& roleOrColor)
{
    if (roleOrColor.startsWith(QLatin1Char('#')))
        return QColor(roleOrColor);
    const std::lock_guard<std::mutex> lock(mutex);
    return colorsInForce().value(roleOrColor).value<QColor>();
}

} // namespace CurrentPalette
} // namespace HmiGuiFramework
