// SPDX-License-Identifier: MIT
#include "hmiapplication.h"

#include "hmicore.h"
#include "hmiinitializer.h"
#include "hmimanager.h"
#include "hmimoduleintegration.h"
#include "hmimodulerootmodel.h"
#include "hmisubmoduleprovider.h"
#include "inputmethodengineinterface.h"
#include "logcategories.h"
#include "moduleinterface.h"
#include "pluginfile.h"
#include "pluginlists.h"

#include <AL2HMIBridge/HMI2ALMessageSender>
#include <AL2HMIBridge/HMI2NAVMessageSender>
#include <AL2HMIBridge/MessageReceivePriorityQueueThread>
#include <AL2HMIBridge/MessageReceiveThread>
#include <AL2HMIBridge/TouchInputReceiverThread>
#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/FrameworkTester>
#include <HmiGuiFramework/GuiDescriptor>
#include <HmiGuiFramework/HmiFrameProvider>
#include <HmiGuiFramework/HmiImageProvider>
#include <HmiGuiFramework/HmiQQuickWindow>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/TransientCollection>
#include <HmiGuiFramework/TransitionManager>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiGuiFramework/ViewManager>
#include <HmiGuiFramework/WindowManager>
#include <HmiStateMachine/HmiState>

#include <QDir>
#include <QQmlContext>
#include <QQmlEngine>
#include <QSortFilterProxyModel>

#include <utility>

using HmiGuiFramework::DataStore;

namespace HmiCore {

namespace {

QDir baseDir()
{
    QDir dir(QCoreApplication::applicationDirPath());
    HmiApplication::moveToBaseDir(dir);
    return dir;
}

QStringList filesIn(const QDir& directory)
{
    return directory.entryList(QDir::Files, QDir::Unsorted);
}

void terminate(QThread* thread)
{
    thread->terminate();
    thread->wait();
}

} // namespace

HmiApplication::HmiApplication(int& argc, char** argv)
    : QGuiApplication(argc, argv)
    , m_engine(new QQmlEngine(this))
    , m_manager(HmiManager::instance())
    , m_touchThread(new AL2HMIBridge::TouchInputReceiverThread(this))
    , m_imageProvider(new HmiGuiFramework::HmiImageProvider)
    , m_frameProvider(new HmiGuiFramework::HmiFrameProvider)
{
    m_receiveThread = AL2HMIBridge::MessageReceiveThread::createInstance(this);
    m_priorityQueueThread = AL2HMIBridge::MessageReceivePriorityQueueThread::createInstance(this);
    AL2HMIBridge::HMI2ALMessageSender::instance();
    AL2HMIBridge::HMI2NAVMessageSender::instance();
    qCDebug(performanceLog) << "starting receive threads";
    qCDebug(traceLog) << "starting receive threads";
    m_priorityQueueThread->begin();
    m_receiveThread->begin();
    m_touchThread->begin();
    connect(m_manager, &HmiManager::showHmiUI, this, &HmiApplication::showHmiUI);
}

HmiApplication::~HmiApplication()
{
    delete m_engine;
    if (!m_engineOwnsProviders) {
        delete m_imageProvider;
        delete m_frameProvider;
    }
    // Not asked to finish: a peer that hangs must not keep the process from ending.
    terminate(m_priorityQueueThread);
    terminate(m_receiveThread);
    terminate(m_touchThread);
}

void HmiApplication::initialize(HmiInitializer* initializer)
{
    initializer->initialize(m_manager, m_engine);
    createFrameworkObjects();
    connectFrameworkObjects();
    if (!m_manager->viewDescriptorPath().isEmpty() && !m_manager->viewPrefix().isEmpty())
        m_viewManager->loadModule(m_manager->viewDescriptorPath(), m_manager->viewPrefix(), 0);
    loadPlugins();
    registerModules(initializer);
    HmiSubmoduleProvider* const submodules = HmiSubmoduleProvider::instance();
    submodules->sortHostedModuleEntryActions();
    initializer->connectTransitions(submodules->rootHierarchyTransitions());
    initializer->connectPopupStates(submodules->rootHierarchyPopupStates());
    initializer->finalizeInitialization();
}

void HmiApplication::createFrameworkObjects()
{
    using namespace HmiGuiFramework;
    QQmlContext* const context = m_engine->rootContext();
    m_engine->addImportPath(AppSettings::mainFolderPath + AppSettings::frameworkImportPath);
    context->setContextProperty(QStringLiteral("_modulesModel"), m_manager->sortedModulesModel());
    context->setContextProperty(QStringLiteral("_menuModuleCollection"), m_manager->moduleModel());
    m_engine->addImageProvider(HmiImageProvider::imageProviderName, m_imageProvider);
    m_engine->addImageProvider(HmiFrameProvider::imageProviderName, m_frameProvider);
    m_engineOwnsProviders = true;
    qCDebug(coreLog) << "Framework imports path set.";
    installCustomLogObjects(m_engine);

    m_appSettings = AppSettings::instance();
    context->setContextProperty(QStringLiteral("AppSettings"), m_appSettings);

    m_transitionManager = new TransitionManager(m_engine, this);
    context->setContextProperty(QStringLiteral("_transitionManager"), m_transitionManager);
    DataStore::store(m_transitionManager, QStringLiteral("TransitionManager"));

    m_viewManager = new ViewManager(m_engine, m_transitionManager, this);
    connect(m_viewManager, &ViewManager::uiVariationChanged, this, &HmiApplication::syncViews);
    DataStore::store(m_viewManager, QStringLiteral("ViewManager"));

    m_statusBarController = new StatusBarController(m_engine, m_viewManager, this);
    context->setContextProperty(QStringLiteral("_statusBarController"), m_statusBarController);
    DataStore::store(m_statusBarController, QStringLiteral("StatusBarController"));

    m_themeManager = new UiThemeManager(m_engine, m_viewManager, m_transitionManager, this);
    DataStore::store(m_themeManager, QStringLiteral("UiThemeManager"));

    m_windowManager = new WindowManager(m_appSettings, this);
    DataStore::store(m_windowManager, QStringLiteral("WindowManager"));
    context->setContextProperty(QStringLiteral("_hmiWindow"), m_windowManager->hmiWindow());
    qCDebug(coreLog) << "Framework objects exported.";
}

void HmiApplication::connectFrameworkObjects()
{
    using namespace HmiGuiFramework;
    HmiQQuickWindow* const window = m_windowManager->hmiWindow();
    connect(m_themeManager, &UiThemeManager::themeChange, this, &HmiApplication::themeChange);
    connect(m_themeManager, &UiThemeManager::paletteChange, this, &HmiApplication::themeChange);
    connect(m_themeManager, &UiThemeManager::paletteChangeComplete, m_manager, &HmiManager::hmiPaletteChange);
    connect(window, &HmiQQuickWindow::idle, m_viewManager, &ViewManager::currentViewIdle);
    connect(m_touchThread, &AL2HMIBridge::TouchInputReceiverThread::passThroughViewTouched, window,
            &HmiQQuickWindow::userActivityNotify);
    connect(m_touchThread, &AL2HMIBridge::TouchInputReceiverThread::passThroughViewTouched, this,
            &HmiApplication::passThroughViewTouched);
}

void HmiApplication::startHmi()
{
    m_manager->start();
}

void HmiApplication::syncViews()
{
    Q_EMIT hmiEntrySync();
    if (m_viewManager) {
        const HmiGuiFramework::GuiDescriptor gui = m_viewManager->guiDescriptor();
        for (const auto& view : gui.views)
            Q_EMIT viewLoaded(view.identifier, view.url.toString());
        for (const auto& popup : gui.popups)
            Q_EMIT popupLoaded(popup.identifier, popup.url.toString());
    }
    if (m_statusBarController) {
        const HmiGuiFramework::TransientCollection collection = m_statusBarController->transients();
        for (const auto& transient : collection.transients) {
            const auto component = collection.components.constFind(transient.componentKey);
            if (component != collection.components.constEnd())
                Q_EMIT transientLoaded(transient.identifier, component->url.toString());
        }
    }
}

void HmiApplication::hmiViewRequest(const QString& name)
{
    HmiGuiFramework::FrameworkTester::hmiViewRequest(name);
}

void HmiApplication::hmiViewBatchRequest(const QList<QString>& names)
{
    HmiGuiFramework::FrameworkTester::hmiViewBatchRequest(names);
}

void HmiApplication::hmiPopupRequest(const QString& name)
{
    HmiGuiFramework::FrameworkTester::hmiPopupRequest(name);
}

void HmiApplication::hmiPopupBatchRequest(const QList<QString>& names)
{
    HmiGuiFramework::FrameworkTester::hmiPopupBatchRequest(names);
}

void HmiApplication::hmiTransientRequest(const QString& identifier)
{
    if (m_statusBarController)
        m_statusBarController->requestTransientWidget(identifier, 0);
}

void HmiApplication::setPassThroughViewActive(bool active)
{
    m_touchThread->setPassThroughViewVisible(active);
}

void HmiApplication::setPassThroughMobileNavTouchParamsOffset(bool active, int x, int y)
{
    m_touchThread->setMobileNavTouchParamsOffset(active, x, y);
}

void HmiApplication::setBlacklistedDomains(const QList<int>& domains)
{
    m_blacklistedDomains = domains;
}

void HmiApplication::moveToBaseDir(QDir& dir)
{
    if (dir.dirName() == QLatin1String("bin"))
        dir.cdUp();
}

void HmiApplication::loadPlugins()
{
    loadModulePlugins();
    loadInputMethodPlugins();
}

void HmiApplication::loadModulePlugins()
{
    QDir directory = baseDir();
    directory.cd(QStringLiteral("plugins")); // without it the base directory is searched
    qCDebug(coreLog) << "Looking for plugins in:" << directory.absolutePath();

    QDir settings = baseDir();
    settings.cd(QStringLiteral("settings"));
    const PluginLists lists = PluginLists::read(settings.absoluteFilePath(QStringLiteral("plugins.conf")));

    const QStringList fileNames = filesIn(directory);
    for (const QString& fileName : fileNames) {
        PluginFile plugin(directory, fileName);
        if (!plugin.hasInterfaceId(qobject_interface_iid<ModuleInterface*>()))
            qCDebug(coreLog) << fileName << " is not an Hmi Module Plugin. Skipping";
        else if (lists.allow(plugin.name()))
            loadModulePlugin(plugin);
    }
    qCDebug(coreLog) << "Loaded" << m_moduleIntegrations.size() << "plugins";
}

void HmiApplication::loadModulePlugin(PluginFile& plugin)
{
    QObject* const root = plugin.rootObject();
    if (!root) {
        qCDebug(coreLog) << "Failed to load plugin" << plugin.fileName();
        return;
    }
    auto* const module = qobject_cast<ModuleInterface*>(root);
    if (!module) {
        qCDebug(coreLog) << "Could not obtain ModuleInterface pointer";
        return;
    }
    createModules(module, plugin.keys());
}

void HmiApplication::createModules(ModuleInterface* module, const QStringList& keys)
{
    for (const QString& key : keys) {
        HmiModuleIntegration* const integration = module->createModuleIntegration(key, this);
        if (!integration) {
            qCDebug(coreLog) << "Failed to create module integration for key =" << key;
            continue;
        }
        m_moduleIntegrations.append(integration);
        if (integration->type() == HmiModuleIntegration::RootModule)
            m_manager->moduleModel()->append(integration);
    }
}

void HmiApplication::loadInputMethodPlugins()
{
    QDir directory = baseDir();
    if (!directory.cd(QStringLiteral("inputmethod-plugins")))
        return;
    const QStringList fileNames = filesIn(directory);
    for (const QString& fileName : fileNames) {
        PluginFile plugin(directory, fileName);
        if (!plugin.hasInterfaceId(qobject_interface_iid<InputMethodEngineInterface*>()))
            qCDebug(coreLog) << fileName << " is not an Hmi Input Method Engine Plugin. Skipping";
        else if (!plugin.hasOwnMetaData())
            qCDebug(coreLog) << fileName << " is missing Hmi Input Method Engine Plugin metadata. Skipping";
        else
            loadInputMethodPlugin(plugin);
    }
}

void HmiApplication::loadInputMethodPlugin(PluginFile& plugin)
{
    QObject* const root = plugin.rootObject();
    if (!root) {
        qCDebug(coreLog) << "Failed to load plugin" << plugin.fileName();
        return;
    }
    auto* const engine = qobject_cast<InputMethodEngineInterface*>(root);
    if (!engine) {
        qCDebug(coreLog) << "Could not obtain InputMethodEngineInterface pointer" << plugin.fileName();
        return;
    }
    const QStringList keys = plugin.keys();
    for (const QString& key : keys)
        if (!engine->registerEngine(key, this))
            qCDebug(coreLog) << plugin.fileName() << "failed to register input method engine" << key;
}

void HmiApplication::registerModules(HmiInitializer* initializer)
{
    HomeCandidate home;
    for (HmiModuleIntegration* const module : std::as_const(m_moduleIntegrations))
        if (module)
            registerModule(module, initializer, home);
    if (home.rootState)
        m_manager->setFactoryDefaultHomeState(home.rootState->name());
    else
        qCWarning(coreLog) << "No inital state found.";
}

void HmiApplication::registerModule(HmiModuleIntegration* module, HmiInitializer* initializer, HomeCandidate& home)
{
    HmiStateMachine::NamedState* const rootState = module->createRootState(m_manager->modulesRootState());
    if (rootState) {
        considerAsHome(module, rootState, home);
        announceEntriesOf(module, rootState);
    }
    module->registerTypes();
    module->setupRootContext(m_engine->rootContext());
    m_viewManager->loadModule(module->viewDescriptorFile(), module->moduleId(), 0);
    initializer->connectTransitions(module->moduleRootHierarchyTransitions());
    initializer->connectPopupStates(module->moduleRootHierarchyPopupStates());
}

void HmiApplication::considerAsHome(const HmiModuleIntegration* module, HmiStateMachine::NamedState* rootState,
                                    HomeCandidate& home)
{
    const int priority = module->modulePriority();
    if (priority < home.priority)
        home = {priority, rootState};
    else if (priority == home.priority)
        qCWarning(coreLog) << "Possible module priority collision detected in " << module->moduleName()
                           << " priority value " << priority;
}

void HmiApplication::announceEntriesOf(const HmiModuleIntegration* module, HmiStateMachine::NamedState* rootState)
{
    if (m_blacklistedDomains.contains(module->moduleDomain()))
        connect(rootState, &QAbstractState::entered, m_manager, &HmiManager::blacklistedModuleRootStateEntered);
    else
        connect(rootState, &QAbstractState::entered, this, &HmiApplication::moduleRootStateActivated);
}

void HmiApplication::themeChange()
{
    m_imageProvider->clearCache();
    m_frameProvider->clearCache();
}

void HmiApplication::moduleRootStateActivated()
{
    if (const auto* const state = qobject_cast<HmiStateMachine::HmiState*>(sender()))
        Q_EMIT m_manager->moduleRootStateActivated(state->name());
}

void HmiApplication::showHmiUI()
{
    if (!m_windowManager)
        return;
    m_windowManager->attachViewmanager(m_viewManager);
    m_windowManager->showScreen();
    Q_EMIT m_manager->hmiThemeSync();
}

} // namespace HmiCore
