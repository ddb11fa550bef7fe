// SPDX-License-Identifier: MIT
#include "phoneplugin.h"

#include "phonemodule.h"

HmiCore::HmiModuleIntegration* PhonePlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("phone") ? new PhoneModule(parent) : nullptr;
}
