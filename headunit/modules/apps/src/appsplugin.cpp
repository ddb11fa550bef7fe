// SPDX-License-Identifier: MIT
#include "appsplugin.h"

#include "appsmodule.h"

HmiCore::HmiModuleIntegration* AppsPlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("apps") ? new AppsModule(parent) : nullptr;
}
