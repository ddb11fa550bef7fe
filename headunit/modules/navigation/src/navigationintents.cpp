// SPDX-License-Identifier: MIT
#include "navigationintents.h"

#include "intenttable.h"
#include "navigator.h"

#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/RequestView>

using HmiCore::HmiIntentManager;
using HmiGuiFramework::RequestView;

namespace {

using Data = IntentTable::Data;

void show(const char* view)
{
    RequestView(QString::fromLatin1(view), QVariant(), false, QVariant())();
}

QString placeIn(const Data& data)
{
    return data.value(0).toString().trimmed();
}

void navigate(Navigator* navigator, const Data& data)
{
    if (placeIn(data).isEmpty()) {
        show("NAVIGATION.Destinations");
        return;
    }
    navigator->navigateTo(navigator->findPlace(placeIn(data)));
    show("NAVIGATION.Main");
}

} // namespace

IntentTable* makeNavigationIntents(Navigator* navigator, QObject* parent)
{
    const auto problem = [navigator](const Data& data) {
        const bool isKnown = placeIn(data).isEmpty() || navigator->findPlace(placeIn(data)) >= 0;
        return isKnown ? QString() : Navigator::tr("The map does not have this place");
    };
    const auto whenGuiding = [navigator] {
        return navigator->isActive() ? QString() : Navigator::tr("There is no destination");
    };
    auto* const intents = new IntentTable(
        {
            {HmiIntentManager::Navigate, [navigator](const Data& data) { navigate(navigator, data); }, {}, problem},
            {HmiIntentManager::ShowNavigationMenu, [](const Data&) { show("NAVIGATION.Main"); }, {}, {}},
            {HmiIntentManager::ShowNavWaypoints, [](const Data&) { show("NAVIGATION.Route"); }, whenGuiding, {}},
            {HmiIntentManager::NavigationSettings, [](const Data&) { show("SETTINGS.Navigation.Main"); }, {}, {}},
        },
        parent);
    intents->watch(navigator, &Navigator::routeChanged);
    return intents;
}
