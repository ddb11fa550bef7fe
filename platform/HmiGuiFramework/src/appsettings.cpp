// SPDX-License-Identifier: MIT
#include "appsettings.h"

#include <QCoreApplication>
#include <QPointer>

namespace HmiGuiFramework {

QString AppSettings::mainFolderPath;
QString AppSettings::frameworkImportPath;

AppSettings::AppSettings(QObject* parent)
    : QObject(parent)
{
}

AppSettings* AppSettings::instance()
{
    static QPointer<AppSettings> settings;
    if (!settings)
        settings = new AppSettings(QCoreApplication::instance());
    return settings;
}

void AppSettings::setWindowSize(const QSize& size)
{
    if (size.isEmpty() || size == m_windowSize)
        return;
    m_windowSize = size;
    Q_EMIT windowSizeChanged();
}

void AppSettings::setFullScreen(bool fullScreen)
{
    if (fullScreen == m_fullScreen)
        return;
    m_fullScreen = fullScreen;
    Q_EMIT fullScreenChanged();
}

void AppSettings::setRightToLeft(bool rightToLeft)
{
    if (rightToLeft == m_rightToLeft)
        return;
    m_rightToLeft = rightToLeft;
    Q_EMIT rightToLeftChanged();
}

void AppSettings::setAnimations(bool animations)
{
    if (animations == m_animations)
        return;
    m_animations = animations;
    Q_EMIT animationsChanged();
}

void AppSettings::setThemeFile(const QString& path)
{
    if (path == m_themeFile)
        return;
    m_themeFile = path;
    Q_EMIT themeFileChanged();
}

void AppSettings::setUiVariation(const QString& variation)
{
    if (variation == m_uiVariation)
        return;
    m_uiVariation = variation;
    Q_EMIT uiVariationChanged();
}

void AppSettings::setViewCacheSize(int views)
{
    views = qMax(0, views);
    if (views == m_viewCacheSize)
        return;
    m_viewCacheSize = views;
    Q_EMIT viewCacheSizeChanged();
}

void AppSettings::setIdleTimeout(int milliseconds)
{
    milliseconds = qMax(0, milliseconds);
    if (milliseconds == m_idleTimeout)
        return;
    m_idleTimeout = milliseconds;
    Q_EMIT idleTimeoutChanged();
}

} // namespace HmiGuiFramework
