// SPDX-License-Identifier: MIT
// A module that is named after the file that it was loaded from, so that copies of the file are different modules.
#include <HmiCore/HmiModuleIntegration>
#include <HmiCore/ModuleInterface>
#include <HmiStateMachine/HmiState>

#include <QFileInfo>

#include <dlfcn.h>

namespace {

QString nameOfThisFile()
{
    static const int here = 0;
    Dl_info info;
    return dladdr(&here, &info) ? QFileInfo(QString::fromLocal8Bit(info.dli_fname)).completeBaseName() : QString();
}

class Module : public HmiCore::HmiModuleIntegration
{
public:
    explicit Module(QObject* parent)
        : HmiModuleIntegration(RootModule, parent)
        , m_name(nameOfThisFile())
    {
    }

    QString moduleName() const override { return m_name; }
    int modulePriority() const override { return m_name.mid(6).toInt() * 7919 % 1000; }
    QString viewDescriptorFile() const override { return QStringLiteral("views/module.json"); }
    HmiStateMachine::Identifier rootStateIdentifier() const override { return moduleId() + QStringLiteral(".Main"); }
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override
    {
        return new HmiStateMachine::HmiState(rootStateIdentifier(), modulesRootState);
    }
    void setupRootContext(QQmlContext*) override {}

private:
    const QString m_name;
};

} // namespace

class BenchPlugin : public QObject, public HmiCore::ModuleInterface
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "com.kest.ivi.ModuleInterface" FILE "bench_module.json")
    Q_INTERFACES(HmiCore::ModuleInterface)

public:
    HmiCore::HmiModuleIntegration* createModuleIntegration(const QString&, QObject* parent) override
    {
        return new Module(parent);
    }
};

#include "bench_module.moc"
