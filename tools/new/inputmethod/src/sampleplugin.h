// SPDX-License-Identifier: MIT
#pragma once

#include "samplefactory.h"

#include <HmiCore/InputMethodEngineInterface>

#include <QObject>

/// \brief Entry of the plugin: registers one engine for each key of sample.json.
class SamplePlugin : public QObject, public HmiCore::InputMethodEngineInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.hmi.InputMethodEngineInterface" FILE "../sample.json")
    Q_INTERFACES(HmiCore::InputMethodEngineInterface)

public:
    bool registerEngine(const QString& key, QObject* parent) override;

private:
    SampleFactory m_factory;
};
