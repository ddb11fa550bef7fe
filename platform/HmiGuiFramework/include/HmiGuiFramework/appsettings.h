// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QObject>
#include <QSize>
#include <QString>

namespace HmiGuiFramework {

/// \brief The product's settings of the framework, known to QML as "AppSettings". GUI thread only.
///
/// The executable sets them before the framework objects are created; later changes of \ref rightToLeft and
/// \ref uiVariation take effect at once, the others with the next object that reads them.
class HMIGUIFRAMEWORK_EXPORT AppSettings : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QSize windowSize READ windowSize WRITE setWindowSize NOTIFY windowSizeChanged)
    Q_PROPERTY(bool fullScreen READ fullScreen WRITE setFullScreen NOTIFY fullScreenChanged)
    Q_PROPERTY(bool rightToLeft READ rightToLeft WRITE setRightToLeft NOTIFY rightToLeftChanged)
    Q_PROPERTY(bool animations READ animations WRITE setAnimations NOTIFY animationsChanged)
    Q_PROPERTY(QString themeFile READ themeFile WRITE setThemeFile NOTIFY themeFileChanged)
    Q_PROPERTY(QString uiVariation READ uiVariation WRITE setUiVariation NOTIFY uiVariationChanged)
    Q_PROPERTY(int viewCacheSize READ viewCacheSize WRITE setViewCacheSize NOTIFY viewCacheSizeChanged)
    Q_PROPERTY(int idleTimeout READ idleTimeout WRITE setIdleTimeout NOTIFY idleTimeoutChanged)

public:
    /// \brief The process's settings, made on the first call as a child of the application object.
    static AppSettings* instance();

    /// \brief Base folder of the product's files, with a trailing slash. Relative descriptor and theme paths start here.
    static QString mainFolderPath;

    /// \brief Folder of QML modules below mainFolderPath, such as "qml".
    static QString frameworkImportPath;

    QSize windowSize() const { return m_windowSize; } ///< pixels; 1280 × 720 by default
    void setWindowSize(const QSize& size);            ///< an empty size is ignored

    bool fullScreen() const { return m_fullScreen; } ///< whether the window covers the screen; false by default
    void setFullScreen(bool fullScreen);

    bool rightToLeft() const { return m_rightToLeft; } ///< whether the layout is mirrored, as for Arabic
    void setRightToLeft(bool rightToLeft);

    bool animations() const { return m_animations; } ///< whether changes on the screen are animated; true by default
    void setAnimations(bool animations);

    QString themeFile() const { return m_themeFile; } ///< theme document; empty for the built-in one
    void setThemeFile(const QString& path);

    QString uiVariation() const
    {
        return m_uiVariation;
    } ///< name of the views' variation, such as "compact"; may be empty
    void setUiVariation(const QString& variation);

    int viewCacheSize() const { return m_viewCacheSize; } ///< views kept beside the current one; 5 by default
    void setViewCacheSize(int views);                     ///< negative counts as 0

    int idleTimeout() const { return m_idleTimeout; } ///< milliseconds without user activity until idle; 0 never
    void setIdleTimeout(int milliseconds);            ///< negative counts as 0

Q_SIGNALS:
    void windowSizeChanged();
    void fullScreenChanged();
    void rightToLeftChanged();
    void animationsChanged();
    void themeFileChanged();
    void uiVariationChanged();
    void viewCacheSizeChanged();
    void idleTimeoutChanged();

private:
    explicit AppSettings(QObject* parent);

    QSize m_windowSize{1280, 720};
    bool m_fullScreen = false;
    bool m_rightToLeft = false;
    bool m_animations = true;
    QString m_themeFile;
    QString m_uiVariation;
    int m_viewCacheSize = 5;
    int m_idleTimeout = 60000;
};

} // namespace HmiGuiFramework
