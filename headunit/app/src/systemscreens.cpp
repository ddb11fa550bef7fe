// SPDX-License-Identifier: MIT
#include "systemscreens.h"

#include "conditionalpopup.h"
#include "display.h"
#include "intenttable.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/ProjectionSource>
#include <AL2HMIBridge/SpeechSource>
#include <AL2HMIBridge/ValetModeSource>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/StateMachine>

#include <algorithm>
#include <iterator>

using namespace AL2HMIBridge;
using HmiCore::HmiIntentManager;
using HmiCore::HmiManager;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiGuiFramework::ViewManager;
using HmiStateMachine::StateMachine;

namespace {

constexpr int keysThatLightByThemselves[] = {41, 60}; // power; display, through its intent
const QString projectionView = QStringLiteral("SYSTEM.Projection");
const QString noticeTransient = QStringLiteral("SYSTEM.Notice");

bool isOn()
{
    return GlobalSource::instance()->powerOn();
}

bool isValet()
{
    return ValetModeSource::instance()->valetModeEnabled();
}

bool isSpeaking()
{
    return SpeechSource::instance()->sessionState() != 0 || SpeechSource::instance()->ttsSessionActive();
}

bool isProjecting()
{
    return ProjectionSource::instance()->projectionMode() != 0;
}

ViewManager* viewManager()
{
    return DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
}

} // namespace

SystemScreens::SystemScreens(QObject* parent)
    : QObject(parent)
    , m_display(new Display(this))
    , m_intents(makeIntents())
{
    addPopups();
    connect(GlobalSource::instance(), &GlobalSource::powerOnChanged, this, &SystemScreens::darkChanged);
    connect(ValetModeSource::instance(), &ValetModeSource::valetModeEnabledChanged, this, &SystemScreens::darkChanged);
    connect(m_display, &Display::offChanged, this, &SystemScreens::darkChanged);
    connect(KeySource::instance(), &KeySource::keyEvent, this, &SystemScreens::switchOnWithAnyKey);
    connect(ProjectionSource::instance(), &ProjectionSource::projectionModeChanged, this,
            &SystemScreens::leaveProjection);

    HmiIntentManager::instance()->registerIntentHandler(m_intents);
    // Queued: the manager is locked while it tells of a failure.
    connect(
        HmiIntentManager::instance(), &HmiIntentManager::handlingFailed, this,
        [this](int, const QString& error) { showNotice(error); }, Qt::QueuedConnection);
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, &SystemScreens::dropNotice);
}

bool SystemScreens::isDark() const
{
    return !isOn() || m_display->isOff() || isValet();
}

void SystemScreens::addPopups()
{
    auto* const standby = new ConditionalPopup(
        QStringLiteral("SYSTEM.Standby"), [] { return !isOn(); }, this);
    standby->watch(GlobalSource::instance(), &GlobalSource::powerOnChanged);
    auto* const dark = new ConditionalPopup(
        QStringLiteral("SYSTEM.DisplayOff"), [this] { return m_display->isOff(); }, this);
    dark->watch(m_display, &Display::offChanged);
    auto* const valet = new ConditionalPopup(QStringLiteral("SYSTEM.Valet"), isValet, this);
    valet->watch(ValetModeSource::instance(), &ValetModeSource::valetModeEnabledChanged);
    auto* const voice = new ConditionalPopup(QStringLiteral("SYSTEM.Voice"), isSpeaking, this);
    voice->watch(SpeechSource::instance(), &SpeechSource::sessionStateChanged, &SpeechSource::ttsSessionActiveChanged);
}

IntentTable* SystemScreens::makeIntents()
{
    const auto whenOn = [] { return isOn() ? QString() : tr("The head unit is switched off"); };
    auto* const intents = new IntentTable(
        {
            {HmiIntentManager::GoHome,
             [](const auto&) { StateMachine::instance()->sendKeySignal(QStringLiteral("Home")); },
             {},
             {}},
            {HmiIntentManager::EnterValetMode,
             [](const auto&) { ValetModeSource::instance()->setValetMode(true); },
             [] { return isValet() ? tr("Valet mode is on already") : QString(); },
             {}},
            {HmiIntentManager::ShowProjection,
             [](const auto&) { viewManager()->requestView(projectionView); },
             [] { return isProjecting() ? QString() : tr("No phone is projected"); },
             {}},
            {HmiIntentManager::RequestDisplayOff, [this](const auto&) { m_display->setOff(true); }, whenOn, {}},
            {HmiIntentManager::RequestDisplayToggle, [this](const auto&) { toggleDisplay(); }, {}, {}},
            {HmiIntentManager::ExitDisplayOffMode, [this](const auto&) { m_display->setOff(false); }, {}, {}},
        },
        this);
    intents->watch(GlobalSource::instance(), &GlobalSource::powerOnChanged);
    intents->watch(ValetModeSource::instance(), &ValetModeSource::valetModeEnabledChanged);
    intents->watch(ProjectionSource::instance(), &ProjectionSource::projectionModeChanged);
    return intents;
}

void SystemScreens::toggleDisplay() const
{
    if (isOn())
        m_display->setOff(!m_display->isOff());
    else
        GlobalSource::instance()->sendPowerOnOffKeyPressed();
}

/// What the key does besides is not held back.
void SystemScreens::switchOnWithAnyKey(int key, int state) const
{
    const bool lightsByItself =
        std::find(std::begin(keysThatLightByThemselves), std::end(keysThatLightByThemselves), key)
        != std::end(keysThatLightByThemselves);
    if (!isOn() && !lightsByItself && state == KeySource::KeyPressed)
        GlobalSource::instance()->sendPowerOnOffKeyPressed();
}

void SystemScreens::leaveProjection() const
{
    if (!isProjecting() && viewManager() && viewManager()->currentView() == projectionView)
        StateMachine::instance()->sendKeySignal(QStringLiteral("Home"));
}

void SystemScreens::showNotice(const QString& error)
{
    m_notice = error.isEmpty() ? tr("This is not possible now") : error.section(QLatin1Char('\n'), 0, 0);
    Q_EMIT noticeChanged();
    DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"))
        ->requestTransientWidget(noticeTransient, 0);
}

/// Its text is in the language that it was made in.
void SystemScreens::dropNotice()
{
    auto* const statusBar = DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"));
    if (statusBar && statusBar->transient() == noticeTransient)
        statusBar->dismissTransient();
}
