// SPDX-License-Identifier: MIT
#include <HmiCore/InputMethodEngineInterface>

#include <QVariant>

class Plugin : public QObject, public HmiCore::InputMethodEngineInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.hmi.InputMethodEngineInterface" FILE "consumerengine.json")
    Q_INTERFACES(HmiCore::InputMethodEngineInterface)

public:
    bool registerEngine(const QString& key, QObject* parent) override
    {
        parent->setProperty("consumerEngine", key == QStringLiteral("pen"));
        return true;
    }
};

#include "consumerengine.moc"
