// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/ModuleInterface>

#include <QObject>

/// \brief Entry of the plugin: makes the navigation module for the key "navigation".
class NavigationPlugin : public QObject, public HmiCore::ModuleInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.ivi.ModuleInterface" FILE "../navigation.json")
    Q_INTERFACES(HmiCore::ModuleInterface)

public:
    HmiCore::HmiModuleIntegration* createModuleIntegration(const QString& key, QObject* parent) override;
};
