// SPDX-License-Identifier: MIT
#include "mediaplugin.h"

#include "mediamodule.h"

HmiCore::HmiModuleIntegration* MediaPlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("media") ? new MediaModule(parent) : nullptr;
}
