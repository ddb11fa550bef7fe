// SPDX-License-Identifier: MIT
#include "palettecontrol.h"

#include <AL2HMIBridge/GlobalSource>
#include <HmiGuiFramework/UiThemeManager>

using AL2HMIBridge::GlobalSource;

PaletteControl::PaletteControl(QObject* parent)
    : QObject(parent)
{
    connect(GlobalSource::instance(), &GlobalSource::nightModeChanged, this, &PaletteControl::apply);
}

void PaletteControl::setMode(Mode mode)
{
    if (mode == m_mode)
        return;
    m_mode = mode;
    apply();
    Q_EMIT modeChanged();
}

void PaletteControl::attach(HmiGuiFramework::UiThemeManager* themeManager)
{
    m_themeManager = themeManager;
    apply();
}

void PaletteControl::apply()
{
    if (!m_themeManager)
        return;
    const bool night = m_mode == Night || (m_mode == Automatic && GlobalSource::instance()->nightMode());
    m_themeManager->setPalette(night ? QStringLiteral("night") : QStringLiteral("day"));
}
