// SPDX-License-Identifier: MIT
#include "moduleactivation.h"

#include <HmiCore/HmiActivationOverrideManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>

using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;

void ModuleActivation::open(int domain, const QString& rootView) const
{
    if (!HmiCore::HmiActivationOverrideManager::instance()->override(domain))
        DataStore::get<ViewManager>(QStringLiteral("ViewManager"))->requestView(rootView);
}
