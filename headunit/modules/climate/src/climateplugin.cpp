// SPDX-License-Identifier: MIT
#include "climateplugin.h"

#include "climatemodule.h"

HmiCore::HmiModuleIntegration* ClimatePlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("climate") ? new ClimateModule(parent) : nullptr;
}
