// SPDX-License-Identifier: MIT
#include "mediaintents.h"

#include "intenttable.h"
#include "mediacontroller.h"

#include <AL2HMIBridge/GlobalSource>
#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>

using AL2HMIBridge::GlobalSource;
using HmiCore::HmiIntentManager;

IntentTable* makeMediaIntents(MediaController* media, QObject* parent)
{
    // Not asked of the controller, which may learn of the change after whoever requests the screen.
    const auto whenHeard = [] {
        const auto source = GlobalSource::instance()->mainAudioSource();
        return MediaController::isMedia(source) ? QString() : MediaController::tr("Nothing plays");
    };
    const auto whenPlaying = [media] {
        if (!media->heard())
            return MediaController::tr("No player is heard");
        return media->available() && media->playing() ? QString() : MediaController::tr("Nothing plays");
    };
    const auto whenPaused = [media] {
        if (!media->heard())
            return MediaController::tr("No player is heard");
        return media->available() && !media->playing() ? QString() : MediaController::tr("There is nothing to resume");
    };
    const auto toggle = [media](const auto&) { media->togglePlayPause(); };
    const auto show = [](const auto&) {
        HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"))
            ->requestView(QStringLiteral("MEDIA.Main"));
    };
    auto* const intents = new IntentTable({{HmiIntentManager::SuspendMediaPlayback, toggle, whenPlaying, {}},
                                           {HmiIntentManager::ResumeMediaPlayback, toggle, whenPaused, {}},
                                           {HmiIntentManager::ShowCurrentAudioPrimary, show, whenHeard, {}}},
                                          parent);
    intents->watch(media, &MediaController::changed);
    intents->watch(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged);
    return intents;
}
