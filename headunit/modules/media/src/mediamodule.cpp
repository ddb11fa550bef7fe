// SPDX-License-Identifier: MIT
#include "mediamodule.h"

#include "../../moduledomains.h"
#include "intenttable.h"
#include "moduletranslation.h"
#include "mediacontroller.h"
#include "mediaintents.h"

#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/MediaAudioSource>
#include <HmiCore/HmiIntentManager>
#include <HmiStateMachine/HmiLayeredState>

#include <QQmlContext>
#include <QUrl>

using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

MediaModule::MediaModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_controller(new MediaController(this))
    , m_intents(makeMediaIntents(m_controller, this))
{
}

QString MediaModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Media"));
}

int MediaModule::modulePriority() const
{
    return 15;
}

int MediaModule::moduleDomain() const
{
    return ModuleDomain::Media;
}

QString MediaModule::viewDescriptorFile() const
{
    return QStringLiteral(":/media/views.json");
}

HmiStateMachine::Identifier MediaModule::rootStateIdentifier() const
{
    return QStringLiteral("MEDIA");
}

QUrl MediaModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/music"));
}

NamedState* MediaModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("MEDIA.Main"), root));
    new HmiState(QStringLiteral("MEDIA.Library"), root);
    new HmiState(QStringLiteral("MEDIA.Disc"), root);
    return root;
}

void MediaModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("media"), this);
    HmiCore::HmiIntentManager::instance()->registerIntentHandler(m_intents);
    rootContext->setContextProperty(QStringLiteral("_media"), m_controller);
    rootContext->setContextProperty(QStringLiteral("_cdSource"), AL2HMIBridge::CDSource::instance());
    rootContext->setContextProperty(QStringLiteral("_mediaSource"), AL2HMIBridge::MediaAudioSource::instance());
}
