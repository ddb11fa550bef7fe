// SPDX-License-Identifier: MIT
#include "productinitializer.h"

#include "nowplaying.h"
#include "palettecontrol.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/XMTunerSource>
#include <HmiCore/HmiManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/KeySignalTransition>

#include <QCoreApplication>
#include <QQmlContext>

using namespace AL2HMIBridge;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiGuiFramework::UiThemeManager;
using HmiGuiFramework::ViewManager;
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
}

void ProductInitializer::exportObjects(QQmlContext* rootContext)
{
    m_rootContext = rootContext;
    m_paletteControl = new PaletteControl(QCoreApplication::instance());
    const QHash<QString, QObject*> objects{
        {QStringLiteral("_bridgeConnection"), BridgeConnection::instance()},
        {QStringLiteral("_globalSource"), GlobalSource::instance()},
        {QStringLiteral("_phoneSource"), PhoneSource::instance()},
        {QStringLiteral("_nowPlaying"), new NowPlaying(QCoreApplication::instance())},
        {QStringLiteral("_paletteControl"), m_paletteControl},
        {QStringLiteral("_stateMachine"), StateMachine::instance()},
    };
    for (auto object = objects.constBegin(); object != objects.constEnd(); ++object)
        rootContext->setContextProperty(object.key(), object.value());
    rootContext->setContextProperty(QStringLiteral("_homeState"), QString());
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
    QObject::connect(GlobalSource::instance(), &GlobalSource::mutedChanged, statusBar, tellOfVolume);
    QObject::connect(BridgeConnection::instance(), &BridgeConnection::connectedChanged, statusBar,
                     [statusBar, wasConnected = false]() mutable {
                         if (wasConnected && !QCoreApplication::closingDown())
                             statusBar->requestTransientWidget(QStringLiteral("SYSTEM.Connection"), 0);
                         wasConnected = true;
                     });
}
