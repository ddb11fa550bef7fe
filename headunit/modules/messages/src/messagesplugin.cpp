// SPDX-License-Identifier: MIT
#include "messagesplugin.h"

#include "messagesmodule.h"

HmiCore::HmiModuleIntegration* MessagesPlugin::createModuleIntegration(const QString& key, QObject* parent)
{
    return key == QLatin1String("messages") ? new MessagesModule(parent) : nullptr;
}
