// SPDX-License-Identifier: MIT
#include "uithememanager.h"

#include "appsettings.h"
#include "currentpalette.h"
#include "guicategory.h"
#include "jsonfile.h"
#include "themedocument.h"

#include <QQmlContext>
#include <QQmlEngine>

namespace HmiGuiFramework {

UiThemeManager::UiThemeManager(QQmlEngine* engine, ViewManager*, TransitionManager*, QObject* parent)
    : QObject(parent)
{
    if (!AppSettings::instance()->themeFile().isEmpty())
        loadTheme(AppSettings::instance()->themeFile());
    engine->rootContext()->setContextProperty(QStringLiteral("_themeManager"), this);
}

UiThemeManager::~UiThemeManager() = default;

QStringList UiThemeManager::palettes() const
{
    QStringList names = m_palettes.keys();
    names.sort();
    return names;
}

bool UiThemeManager::loadTheme(const QString& path)
{
    const ThemeDocument document = ThemeDocument::read(resolvedPath(path));
    if (!document.error.isEmpty()) {
        qCWarning(guiCategory).noquote() << "theme" << path << "refused:" << document.error;
        return false;
    }
    m_palettes = document.palettes;
    for (auto value = document.values.constBegin(); value != document.values.constEnd(); ++value)
        m_values.insert(value.key(), value.value());
    applyPalette(m_palettes.contains(m_palette) ? m_palette : document.defaultPalette);
    Q_EMIT themeChange();
    return true;
}

void UiThemeManager::setPalette(const QString& palette)
{
    if (palette == m_palette)
        return;
    if (!m_palettes.contains(palette)) {
        qCWarning(guiCategory).noquote() << "palette" << palette.left(128) << "refused: the theme does not have it";
        return;
    }
    applyPalette(palette);
}

void UiThemeManager::applyPalette(const QString& palette)
{
    const QVariantMap colors = m_palettes.value(palette);
    CurrentPalette::set(colors); // before paletteChange(): it clears the image caches, which fill up from here
    const bool changed = palette != m_palette;
    m_palette = palette;
    Q_EMIT paletteChange(palette);
    for (auto color = colors.constBegin(); color != colors.constEnd(); ++color)
        m_colors.insert(color.key(), color.value());
    if (changed)
        Q_EMIT paletteChanged();
    Q_EMIT paletteChangeComplete(palette);
}

} // namespace HmiGuiFramework
