// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QHash>
#include <QObject>
#include <QQmlPropertyMap>
#include <QStringList>
#include <QVariantMap>

QT_BEGIN_NAMESPACE
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiGuiFramework {

class TransitionManager;
class ViewManager;

/// \brief The theme's colours by role, in palettes such as "day" and "night", and its measures. GUI thread only.
///
/// Theme documents are described in docs/themes.md. QML knows the manager as "_themeManager" and binds to
/// `_themeManager.colors.<role>` and `_themeManager.values.<name>`; a change of palette or theme changes them in place.
class HMIGUIFRAMEWORK_EXPORT UiThemeManager : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString palette READ palette WRITE setPalette NOTIFY paletteChanged)
    Q_PROPERTY(QStringList palettes READ palettes NOTIFY themeChange)
    Q_PROPERTY(QQmlPropertyMap* colors READ colors CONSTANT)
    Q_PROPERTY(QQmlPropertyMap* values READ values CONSTANT)

public:
    UiThemeManager(QQmlEngine* engine, ViewManager* viewManager, TransitionManager* transitionManager, QObject* parent);
    ~UiThemeManager() override;

    /// \brief Reads a theme document and puts it in force, keeping the palette when the new theme has it too.
    ///
    /// False, with one warning that names file and field, and with the old theme kept, when the document is faulty.
    Q_INVOKABLE bool loadTheme(const QString& path);

    QString palette() const { return m_palette; } ///< the palette in force
    QStringList palettes() const;                 ///< all palettes of the theme, sorted
    void setPalette(const QString& palette);      ///< an unknown palette is refused with a warning

    QQmlPropertyMap* colors() { return &m_colors; } ///< colour by role; owned by the manager
    QQmlPropertyMap* values() { return &m_values; } ///< number or text by name, such as sizes and fonts

Q_SIGNALS:
    /// \brief Another theme is in force.
    void themeChange();

    /// \brief A palette is being put in force; colours are still the old ones.
    void paletteChange(const QString& paletteId);

    /// \brief All colours are those of the new palette.
    void paletteChangeComplete(const QString& paletteId);

    void paletteChanged();

private:
    void applyPalette(const QString& palette);

    QHash<QString, QVariantMap> m_palettes;
    QString m_palette;
    QQmlPropertyMap m_colors;
    QQmlPropertyMap m_values;
};

} // namespace HmiGuiFramework
