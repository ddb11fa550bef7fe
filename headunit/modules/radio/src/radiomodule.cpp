// SPDX-License-Identifier: MIT
#include "radiomodule.h"

#include "../../moduledomains.h"
#include "conditionalpopup.h"
#include "intenttable.h"
#include "moduletranslation.h"
#include "radiocontroller.h"
#include "radiointents.h"

#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/XMTunerSource>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiSubmoduleProvider>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/PopupState>

#include <QQmlContext>
#include <QUrl>

using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;
using HmiStateMachine::PopupState;
using HmiStateMachine::StateLevel;

namespace {
const QString announcementPopup = QStringLiteral("RADIO.Announcement");
}

RadioModule::RadioModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_controller(new RadioController(this))
    , m_announcement(new ConditionalPopup(
          announcementPopup, [this] { return m_controller->announcing() != nullptr; }, this))
    , m_intents(makeRadioIntents(m_controller, m_announcement, this))
{
    m_announcement->watch(m_controller, &RadioController::announcementChanged);
}

QString RadioModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Radio"));
}

int RadioModule::modulePriority() const
{
    return 10;
}

int RadioModule::moduleDomain() const
{
    return ModuleDomain::Radio;
}

QString RadioModule::viewDescriptorFile() const
{
    return QStringLiteral(":/radio/views.json");
}

HmiStateMachine::Identifier RadioModule::rootStateIdentifier() const
{
    return QStringLiteral("RADIO");
}

QUrl RadioModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/radio"));
}

NamedState* RadioModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("RADIO.Main"), root));
    new HmiState(QStringLiteral("RADIO.Stations"), root);

    // The sound page belongs to the settings module; it is built into this state as soon as that module offers it.
    auto* const sound = new HmiLayeredState(QStringLiteral("RADIO.Sound"), root);
    HmiCore::HmiSubmoduleProvider::instance()->requestSubmodule(ModuleDomain::Sound, sound, sound->name(),
                                                                moduleDomain());
    m_announcementState = new PopupState(announcementPopup);
    return root;
}

QList<QPair<StateLevel, PopupState*>> RadioModule::moduleRootHierarchyPopupStates() const
{
    return {{HmiStateMachine::PopupLevel, m_announcementState}};
}

void RadioModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("radio"), this);
    HmiCore::HmiIntentManager::instance()->registerIntentHandler(m_intents);
    rootContext->setContextProperty(QStringLiteral("_radio"), m_controller);
    rootContext->setContextProperty(QStringLiteral("_fmTuner"), AL2HMIBridge::FMTunerSource::instance());
    rootContext->setContextProperty(QStringLiteral("_xmTuner"), AL2HMIBridge::XMTunerSource::instance());
}
