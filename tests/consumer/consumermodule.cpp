// SPDX-License-Identifier: MIT
#include <HmiCore/HmiModuleIntegration>
#include <HmiCore/ModuleInterface>
#include <HmiStateMachine/HmiState>

namespace {

class Module : public HmiCore::HmiModuleIntegration
{
public:
    using HmiModuleIntegration::HmiModuleIntegration;

    QString moduleName() const override { return QStringLiteral("Consumer"); }
    int modulePriority() const override { return 1; }
    QString viewDescriptorFile() const override { return QStringLiteral("none.json"); }
    HmiStateMachine::Identifier rootStateIdentifier() const override { return QStringLiteral("CONSUMER.Main"); }
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override
    {
        return new HmiStateMachine::HmiState(rootStateIdentifier(), modulesRootState);
    }
    void setupRootContext(QQmlContext*) override {}
};

} // namespace

class Plugin : public QObject, public HmiCore::ModuleInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.ivi.ModuleInterface" FILE "consumermodule.json")
    Q_INTERFACES(HmiCore::ModuleInterface)

public:
    HmiCore::HmiModuleIntegration* createModuleIntegration(const QString& key, QObject* parent) override
    {
        return key == QStringLiteral("consumer") ? new Module(Module::RootModule, parent) : nullptr;
    }
};

#include "consumermodule.moc"
