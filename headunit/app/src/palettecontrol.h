// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

namespace HmiGuiFramework {
class UiThemeManager;
}

/// \brief Chooses the palette: day, night, or as the vehicle's light sensor says. GUI thread only.
class PaletteControl : public QObject
{
    Q_OBJECT
    Q_PROPERTY(Mode mode READ mode WRITE setMode NOTIFY modeChanged)

public:
    enum Mode { Automatic, Day, Night };
    Q_ENUM(Mode)

    explicit PaletteControl(QObject* parent);

    Mode mode() const { return m_mode; }
    void setMode(Mode mode);

    /// \brief Starts to set the palette of \a themeManager, which must outlive this object.
    void attach(HmiGuiFramework::UiThemeManager* themeManager);

Q_SIGNALS:
    void modeChanged();

private:
    void apply();

    HmiGuiFramework::UiThemeManager* m_themeManager = nullptr;
    Mode m_mode = Automatic;
};
