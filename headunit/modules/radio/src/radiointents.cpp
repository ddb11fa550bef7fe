// SPDX-License-Identifier: MIT
#include "radiointents.h"

#include "conditionalpopup.h"
#include "intenttable.h"
#include "radiocontroller.h"

#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/ProjectionSource>
#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>

#include <QMetaEnum>

using namespace AL2HMIBridge;
using HmiCore::HmiIntentManager;

namespace {

using Data = IntentTable::Data;

bool isKnownSource(int source)
{
    return source >= 0 && QMetaEnum::fromType<GlobalSource::ALAudioSource>().valueToKey(source);
}

bool isPlayable(int source)
{
    const auto disc = CDSource::instance()->cdStatus();
    switch (source) {
    case GlobalSource::AudioCD:
        return disc == CDSource::CDPlaying || disc == CDSource::CDPaused;
    case GlobalSource::AudioProjectionWired:
    case GlobalSource::AudioProjectionWireless:
        return ProjectionSource::instance()->projectionMode() != 0;
    default:
        return true;
    }
}

/// The first item is the source, the second its instance; without data it is the source that comes next.
int sourceOf(const Data& data)
{
    return data.value(0, int(GlobalSource::AudioNext)).toInt();
}

QString problemOfSource(const Data& data)
{
    bool isNumber = true;
    if (!data.isEmpty())
        data.first().toInt(&isNumber);
    if (!isNumber || !isKnownSource(sourceOf(data)))
        return RadioController::tr("There is no such source");
    return isPlayable(sourceOf(data)) ? QString() : RadioController::tr("This source cannot play now");
}

void changeSource(const Data& data)
{
    GlobalSource::instance()->setAudioSource(GlobalSource::ALAudioSource(sourceOf(data)), data.value(1, -1).toInt());
}

void showRadio(const Data&)
{
    HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"))
        ->requestView(QStringLiteral("RADIO.Main"));
}

} // namespace

IntentTable* makeRadioIntents(RadioController* radio, ConditionalPopup* announcement, QObject* parent)
{
    const auto whenHeard = [radio] { return radio->heard() ? QString() : RadioController::tr("Nothing plays"); };
    const auto whenAnnouncing = [radio] {
        return radio->announcing() ? QString() : RadioController::tr("There is no announcement");
    };
    auto* const intents = new IntentTable(
        {
            {HmiIntentManager::ChangeAudioSource, changeSource, {}, problemOfSource},
            {HmiIntentManager::ShowCurrentAudioPrimary, showRadio, whenHeard, {}},
            {HmiIntentManager::CancelAnnouncement,
             [announcement](const Data&) { announcement->dismiss(); },
             whenAnnouncing,
             {}},
        },
        parent);
    intents->watch(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged);
    intents->watch(radio, &RadioController::announcementChanged);
    return intents;
}
