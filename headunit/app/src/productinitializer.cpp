// SPDX-License-Identifier: MIT
#include "productinitializer.h"

#include "audiosources.h"
#include "conditionalpopup.h"
#include "developerlink.h"
#include "drivinglock.h"
#include "focuscontrol.h"
#include "ink.h"
#include "inputpanel.h"
#include "intenttable.h"
#include "language.h"
#include "market.h"
#include "modulemarks.h"
#include "moduleactivation.h"
#include "nowplaying.h"
#include "palettecontrol.h"
#include "searchmodel.h"
#include "systemscreens.h"
#include "turnhint.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/BezelDiagnosticsSource>
#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/EAPhoneSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/ProjectionSource>
#include <AL2HMIBridge/SpeechSource>
#include <AL2HMIBridge/ValetModeSource>
#include <AL2HMIBridge/XMTunerSource>
#include <HmiCore/HardKeyController>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiManager>
#include <HmiCore/hmicore.h>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiGuiFramework/ViewManager>
#include <HmiGuiFramework/WindowManager>
#include <HmiStateMachine/KeySignalTransition>

#include <QCoreApplication>
#include <QQmlContext>

using namespace AL2HMIBridge;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiGuiFramework::UiThemeManager;
using HmiGuiFramework::ViewManager;
using HmiGuiFramework::WindowManager;
using HmiStateMachine::KeySignalTransition;
using HmiStateMachine::PopupState;
using HmiStateMachine::StateLevel;
using HmiStateMachine::StateMachine;

namespace {

template <typename Framework>
Framework* framework(const char* name)
{
    return DataStore::get<Framework>(QString::fromLatin1(name));
}

void goBack()
{
    auto* const views = framework<ViewManager>("ViewManager");
    if (!views->back())
        StateMachine::instance()->sendKeySignal(QStringLiteral("Home"));
}

} // namespace

ProductInitializer::ProductInitializer(bool night)
    : m_night(night)
{
}

ProductInitializer::~ProductInitializer() = default;

void ProductInitializer::initializeSources()
{
    // Made here, in the GUI thread, before the first message for them is delivered.
    GlobalSource::instance();
    AMTunerSource::instance();
    FMTunerSource::instance();
    XMTunerSource::instance();
    DABTunerSource::instance();
    CDSource::instance();
    MediaAudioSource::instance();
    PhoneSource::instance();
    EAPhoneSource::instance();
    SpeechSource::instance();
    ProjectionSource::instance();
    ValetModeSource::instance();
    BezelDiagnosticsSource::instance();
    KeySource::instance();
    HmiCore::HardKeyController::instance();
    new DeveloperLink(QCoreApplication::instance());
}

void ProductInitializer::registerQmlTypes()
{
    HmiCore::registerTypes();
    qmlRegisterType<Ink>("HeadUnit.Input", 1, 0, "Ink");
}

/// Before the modules are loaded: the product's translators have to be installed before theirs.
void ProductInitializer::postInit(HmiCore::HmiManager*)
{
    m_language->start();
}

void ProductInitializer::exportObjects(QQmlContext* rootContext)
{
    m_rootContext = rootContext;
    m_paletteControl = new PaletteControl(QCoreApplication::instance());
    m_drivingLock = new DrivingLock(QCoreApplication::instance());
    m_focusControl = new FocusControl(QCoreApplication::instance());
    m_market = new Market(QCoreApplication::instance());
    m_language = new Language(m_market, rootContext->engine(), QCoreApplication::instance());
    const QHash<QString, QObject*> objects{
        {QStringLiteral("_bridgeConnection"), BridgeConnection::instance()},
        {QStringLiteral("_globalSource"), GlobalSource::instance()},
        {QStringLiteral("_phoneSource"), PhoneSource::instance()},
        {QStringLiteral("_eaPhoneSource"), EAPhoneSource::instance()},
        {QStringLiteral("_projectionSource"), ProjectionSource::instance()},
        {QStringLiteral("_speechSource"), SpeechSource::instance()},
        {QStringLiteral("_valetModeSource"), ValetModeSource::instance()},
        {QStringLiteral("_systemScreens"), new SystemScreens(QCoreApplication::instance())},
        {QStringLiteral("_audioSources"), new AudioSources(*m_market, QCoreApplication::instance())},
        {QStringLiteral("_turnHint"), new TurnHint(QCoreApplication::instance())},
        {QStringLiteral("_inputPanel"), makeInputPanel()},
        {QStringLiteral("_focusControl"), m_focusControl},
        {QStringLiteral("_drivingLock"), m_drivingLock},
        {QStringLiteral("_moduleActivation"), new ModuleActivation(QCoreApplication::instance())},
        {QStringLiteral("_searchModel"), new SearchModel(*m_market, QCoreApplication::instance())},
        {QStringLiteral("_moduleMarks"), new ModuleMarks(QCoreApplication::instance())},
        {QStringLiteral("_nowPlaying"), new NowPlaying(QCoreApplication::instance())},
        {QStringLiteral("_paletteControl"), m_paletteControl},
        {QStringLiteral("_stateMachine"), StateMachine::instance()},
        {QStringLiteral("_market"), m_market},
        {QStringLiteral("_language"), m_language},
    };
    for (auto object = objects.constBegin(); object != objects.constEnd(); ++object)
        rootContext->setContextProperty(object.key(), object.value());
    rootContext->setContextProperty(QStringLiteral("_homeState"), QString());
}

InputPanel* ProductInitializer::makeInputPanel() const
{
    auto* const panel = new InputPanel(*m_language, *m_drivingLock, QCoreApplication::instance());
    auto* const popup = new ConditionalPopup(
        QStringLiteral("SYSTEM.InputPanel"), [panel] { return panel->isOpen(); }, panel);
    popup->watch(panel, &InputPanel::openChanged);
    auto* const intents =
        new IntentTable({{HmiCore::HmiIntentManager::ChangeKeyboardLayout,
                          [panel](const auto&) { panel->useNextLayout(); },
                          [panel] { return panel->isOpen() ? QString() : InputPanel::tr("Nothing is typed now"); },
                          {}}},
                        panel);
    intents->watch(panel, &InputPanel::openChanged);
    HmiCore::HmiIntentManager::instance()->registerIntentHandler(intents);
    return panel;
}

void ProductInitializer::buildTopStateTree()
{
    m_states = std::make_unique<TopStateTree>(StateMachine::instance());
}

HmiStateMachine::HmiState* ProductInitializer::modulesRootState()
{
    return m_states->modulesRoot();
}

QString ProductInitializer::rootHierarchyViewDescriptorPath()
{
    return QStringLiteral(":/app/views.json");
}

QString ProductInitializer::rootHierarchyViewPrefix()
{
    return QStringLiteral("SYSTEM");
}

void ProductInitializer::connectPopupStates(const QList<QPair<StateLevel, PopupState*>>& states)
{
    for (const auto& state : states)
        m_states->addPopupState(state.first, state.second);
}

void ProductInitializer::completeInitialization()
{
    connectTransitions(m_states->transitions());
    auto* const back = new KeySignalTransition(QStringLiteral("Back"), m_states->modulesRoot());
    QObject::connect(back, &QAbstractTransition::triggered, &goBack);

    // A vehicle that has been reset starts with its home module again.
    QObject::connect(HmiCore::HmiManager::instance(), &HmiCore::HmiManager::masterResetEnd, StateMachine::instance(),
                     [] {
                         framework<ViewManager>("ViewManager")
                             ->requestView(HmiCore::HmiManager::instance()->factoryDefaultHomeState());
                     });
    m_rootContext->setContextProperty(QStringLiteral("_homeState"),
                                      HmiCore::HmiManager::instance()->factoryDefaultHomeState());

    auto* const theme = framework<UiThemeManager>("UiThemeManager");
    m_paletteControl->setMode(m_night ? PaletteControl::Night : PaletteControl::Automatic);
    m_paletteControl->attach(theme);
    m_focusControl->attach(framework<WindowManager>("WindowManager")->hmiWindow());
    watchTransients();
}

/// The notices that tell of a change, from the second connection state on: at the start there is nothing to tell.
void ProductInitializer::watchTransients() const
{
    auto* const statusBar = framework<StatusBarController>("StatusBarController");
    const auto tellOfVolume = [statusBar] {
        if (BridgeConnection::instance()->synchronised())
            statusBar->requestTransientWidget(QStringLiteral("SYSTEM.Volume"), 0);
    };
    QObject::connect(GlobalSource::instance(), &GlobalSource::volumeChanged, statusBar, tellOfVolume);
    QObject::connect(GlobalSource::instance(), &GlobalSource::voiceVolumeChanged, statusBar, tellOfVolume);
    QObject::connect(GlobalSource::instance(), &GlobalSource::mutedChanged, statusBar, tellOfVolume);
    QObject::connect(BridgeConnection::instance(), &BridgeConnection::connectedChanged, statusBar,
                     [statusBar, wasConnected = false]() mutable {
                         if (wasConnected && !QCoreApplication::closingDown())
                             statusBar->requestTransientWidget(QStringLiteral("SYSTEM.Connection"), 0);
                         wasConnected = true;
                     });
}
