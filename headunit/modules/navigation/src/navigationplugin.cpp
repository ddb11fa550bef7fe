// SPDX-License-Identifier: MIT
#include "navigationplugin.h"

#include "navigationmodule.h"

HmiCore::HmiModuleIntegration* NavigationPlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("navigation") ? new NavigationModule(parent) : nullptr;
}
