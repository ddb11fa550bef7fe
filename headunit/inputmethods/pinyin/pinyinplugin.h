// SPDX-License-Identifier: MIT
#pragma once

#include "pinyinfactory.h"

#include <HmiCore/InputMethodEngineInterface>

#include <QObject>

/// \brief Entry of the plugin: the keyboard engine of Simplified Chinese.
class PinyinPlugin : public QObject, public HmiCore::InputMethodEngineInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.hmi.InputMethodEngineInterface" FILE "pinyin.json")
    Q_INTERFACES(HmiCore::InputMethodEngineInterface)

public:
    bool registerEngine(const QString& key, QObject* parent) override;

private:
    bool m_registered = false;
    Pinyin::PinyinFactory m_factory; ///< outlives an application: a language can be registered only once
};
