// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/InputMethodEngineInterface>

#include <QObject>
#include <QSet>

/// \brief Entry of the plugin: handwriting of Simplified and Traditional Chinese.
class ZinniaPlugin : public QObject, public HmiCore::InputMethodEngineInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.hmi.InputMethodEngineInterface" FILE "zinnia.json")
    Q_INTERFACES(HmiCore::InputMethodEngineInterface)

public:
    bool registerEngine(const QString& key, QObject* parent) override;

private:
    QSet<int> m_registered; ///< their factories outlive an application: a language can be registered only once
};
