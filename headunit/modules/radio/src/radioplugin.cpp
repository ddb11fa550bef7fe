// SPDX-License-Identifier: MIT
#include "radioplugin.h"

#include "radiomodule.h"

HmiCore::HmiModuleIntegration* RadioPlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("radio") ? new RadioModule(parent) : nullptr;
}
