// SPDX-License-Identifier: MIT
#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/HmiImageProvider>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiGuiFramework/WindowManager>

#include <QQmlContext>
#include <QQmlEngine>
#include <QtQuickTest>

#include <memory>

using namespace HmiGuiFramework;

/// What the core exports to QML before the first view is made, as far as the visual language needs it.
class Setup : public QObject
{
    Q_OBJECT

public Q_SLOTS:
    void qmlEngineAvailable(QQmlEngine* engine)
    {
        AppSettings::instance()->setThemeFile(QStringLiteral(":/theme/theme.json"));
        AppSettings::instance()->setAnimations(false);
        m_windows = std::make_unique<WindowManager>(AppSettings::instance(), nullptr);
        m_theme = std::make_unique<UiThemeManager>(engine, nullptr, nullptr, nullptr);
        engine->addImageProvider(HmiImageProvider::imageProviderName, new HmiImageProvider);
        m_lock.setProperty("locked", false);
        engine->rootContext()->setContextProperty(QStringLiteral("_drivingLock"), &m_lock);
        engine->rootContext()->setContextProperty(QStringLiteral("AppSettings"), AppSettings::instance());
        engine->rootContext()->setContextProperty(QStringLiteral("_hmiWindow"), m_windows->hmiWindow());
    }

    void cleanupTestCase()
    {
        m_theme.reset();
        m_windows.reset();
    }

private:
    QObject m_lock; ///< as the product's, with a property "locked"
    std::unique_ptr<WindowManager> m_windows;
    std::unique_ptr<UiThemeManager> m_theme;
};

QUICK_TEST_MAIN_WITH_SETUP(hmiui, Setup)
#include "tst_hmiui.moc"
