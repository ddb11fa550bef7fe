// SPDX-License-Identifier: MIT
#include "sampleplugin.h"

#include "samplemodule.h"

HmiCore::HmiModuleIntegration* SamplePlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("sample") ? new SampleModule(parent) : nullptr;
}
