// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QGuiApplication>
#include <QList>
#include <QString>

#include <limits>

QT_BEGIN_NAMESPACE
class QDir;
class QQmlEngine;
QT_END_NAMESPACE

namespace AL2HMIBridge {
class MessageReceivePriorityQueueThread;
class MessageReceiveThread;
class TouchInputReceiverThread;
} // namespace AL2HMIBridge

namespace HmiGuiFramework {
class AppSettings;
class HmiFrameProvider;
class HmiImageProvider;
class StatusBarController;
class TransitionManager;
class UiThemeManager;
class ViewManager;
class WindowManager;
} // namespace HmiGuiFramework

namespace HmiStateMachine {
class NamedState;
}

namespace HmiCore {

class HmiInitializer;
class HmiManager;
class HmiModuleIntegration;
class InputMethodEngineInterface;
class ModuleInterface;
class PluginFile;

/// \brief The application object: it builds the whole system and owns it.
///
/// The executable constructs it, hands its HmiInitializer to initialize(), calls startHmi() and enters the event loop.
/// The window appears when somebody emits HmiManager::showHmiUI(). All operations belong to the GUI thread.
class HMICORE_EXPORT HmiApplication : public QGuiApplication
{
    Q_OBJECT

public:
    /// \brief Starts the threads that receive from the application layer.
    ///
    /// The arguments go to QGuiApplication as they are and must stay valid as long as it lives.
    HmiApplication(int& argc, char** argv);

    /// \brief Deletes the QML engine, terminates the receive threads and deletes everything else.
    ~HmiApplication() override;

    /// \brief Builds the system: the initializer's hooks, the GUI framework, plugins and modules. To be called once.
    ///
    /// The initializer stays with the caller and is not used any more afterwards. Whatever fails is logged by those whom
    /// it concerns, and the rest goes on.
    void initialize(HmiInitializer* initializer);

    /// \brief Starts the state machine. To be called once, after initialize().
    void startHmi();

    /// \brief Announces all loaded views, popups and transients: hmiEntrySync() first, then one signal for each.
    void syncViews();

    /// \brief Shows views or popups by name for a test harness.
    void hmiViewRequest(const QString& name);
    void hmiViewBatchRequest(const QList<QString>& names);  ///< \overload
    void hmiPopupRequest(const QString& name);              ///< \overload
    void hmiPopupBatchRequest(const QList<QString>& names); ///< \overload

    /// \brief Shows a status-bar transient for its own time; does nothing before initialize().
    void hmiTransientRequest(const QString& identifier);

    /// \brief Tells the layer behind the HMI whether it can be seen and touched.
    void setPassThroughViewActive(bool active);

    /// \brief Tells the layer behind the HMI whether touches are moved for mobile navigation, and by how many pixels.
    void setPassThroughMobileNavTouchParamsOffset(bool active, int x, int y);

    /// \brief Sets the domains of modules whose activation is announced by
    /// HmiManager::blacklistedModuleRootStateEntered() instead of moduleRootStateActivated(). Before initialize().
    void setBlacklistedDomains(const QList<int>& domains);

    /// \brief Loads module plugins and input-method plugins from the directories beside the executable.
    ///
    /// Called by initialize(). What cannot be used is logged and skipped. Plugins are not unloaded.
    void loadPlugins();

    /// \brief Registers every module that the plugins have made, and chooses the factory-default home state.
    ///
    /// Called by initialize(), after loadPlugins().
    void registerModules(HmiInitializer* initializer);

    /// \brief Goes up from a directory that is named "bin", in exactly this spelling; leaves others as they are.
    static void moveToBaseDir(QDir& dir);

Q_SIGNALS:
    /// \brief The announcements of syncViews() begin.
    void hmiEntrySync();
    void viewLoaded(const QString& identifier, const QString& url);      ///< one of the loaded views
    void popupLoaded(const QString& identifier, const QString& url);     ///< one of the loaded popups
    void transientLoaded(const QString& identifier, const QString& url); ///< one of the loaded transients

    /// \brief The layer behind the HMI was touched.
    void passThroughViewTouched();

private Q_SLOTS:
    void themeChange();
    void moduleRootStateActivated();
    void showHmiUI();

private:
    struct HomeCandidate
    {
        int priority = std::numeric_limits<int>::max();
        HmiStateMachine::NamedState* rootState = nullptr;
    };

    void createFrameworkObjects();
    void connectFrameworkObjects();
    void loadModulePlugins();
    void loadModulePlugin(PluginFile& plugin);
    void createModules(ModuleInterface* module, const QStringList& keys);
    void loadInputMethodPlugins();
    void loadInputMethodPlugin(PluginFile& plugin);
    void registerModule(HmiModuleIntegration* module, HmiInitializer* initializer, HomeCandidate& home);
    static void considerAsHome(const HmiModuleIntegration* module, HmiStateMachine::NamedState* rootState,
                               HomeCandidate& home);
    void announceEntriesOf(const HmiModuleIntegration* module, HmiStateMachine::NamedState* rootState);

    QQmlEngine* m_engine;
    QList<HmiModuleIntegration*> m_moduleIntegrations;
    HmiManager* m_manager;
    AL2HMIBridge::MessageReceiveThread* m_receiveThread = nullptr;
    AL2HMIBridge::MessageReceivePriorityQueueThread* m_priorityQueueThread = nullptr;
    AL2HMIBridge::TouchInputReceiverThread* m_touchThread;
    HmiGuiFramework::AppSettings* m_appSettings = nullptr;
    HmiGuiFramework::UiThemeManager* m_themeManager = nullptr;
    HmiGuiFramework::StatusBarController* m_statusBarController = nullptr;
    HmiGuiFramework::ViewManager* m_viewManager = nullptr;
    HmiGuiFramework::TransitionManager* m_transitionManager = nullptr;
    HmiGuiFramework::WindowManager* m_windowManager = nullptr;
    HmiGuiFramework::HmiImageProvider* m_imageProvider;
    HmiGuiFramework::HmiFrameProvider* m_frameProvider;
    bool m_engineOwnsProviders = false;
    QList<int> m_blacklistedDomains;
};

} // namespace HmiCore
