// SPDX-License-Identifier: MIT
#pragma once

#include "zhuyinfactory.h"

#include <HmiCore/InputMethodEngineInterface>

#include <QObject>

/// \brief Entry of the plugin: the keyboard engine of Traditional Chinese.
class ZhuyinPlugin : public QObject, public HmiCore::InputMethodEngineInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.hmi.InputMethodEngineInterface" FILE "zhuyin.json")
    Q_INTERFACES(HmiCore::InputMethodEngineInterface)

public:
    bool registerEngine(const QString& key, QObject* parent) override;

private:
    bool m_registered = false;
    Zhuyin::ZhuyinFactory m_factory; ///< outlives an application: a language can be registered only once
};
