// SPDX-License-Identifier: MIT
#pragma once

#include "latinfactory.h"

#include <HmiCore/InputMethodEngineInterface>

#include <QObject>

/// \brief Entry of the plugin: handwriting of Latin letters.
class LatinPlugin : public QObject, public HmiCore::InputMethodEngineInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.hmi.InputMethodEngineInterface" FILE "latin.json")
    Q_INTERFACES(HmiCore::InputMethodEngineInterface)

public:
    bool registerEngine(const QString& key, QObject* parent) override;

private:
    Latin::LatinFactory m_factory;
    bool m_registered = false; ///< the factory outlives an application: a language can be registered only once
};
