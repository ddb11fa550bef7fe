// SPDX-License-Identifier: MIT
#include "settingsplugin.h"

#include "settingsmodule.h"

HmiCore::HmiModuleIntegration* SettingsPlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("settings") ? new SettingsModule(parent) : nullptr;
}
