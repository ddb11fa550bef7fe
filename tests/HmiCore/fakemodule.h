// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

/// A module that is made of values.
class FakeModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit FakeModule(const QString& moduleName, int modulePriority = 0, int moduleDomain = 0,
                        ModuleType type = RootModule, QObject* parent = nullptr)
        : HmiModuleIntegration(type, parent)
        , name(moduleName)
        , priority(modulePriority)
        , domain(moduleDomain)
    {
    }

    QString moduleName() const override { return name; }
    int modulePriority() const override { return priority; }
    int moduleDomain() const override { return domain; }
    QString viewDescriptorFile() const override { return QStringLiteral(":/") + name + QStringLiteral(".json"); }
    HmiStateMachine::Identifier rootStateIdentifier() const override { return name + QStringLiteral(".Root"); }
    QUrl iconUrl() const override { return icon; }
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState*) override { return nullptr; }
    void setupRootContext(QQmlContext*) override {}

    void setIconUrl(const QUrl& url)
    {
        icon = url;
        Q_EMIT iconUrlChanged(url);
    }
    using HmiModuleIntegration::setBlocked;

    QString name;
    int priority;
    int domain;
    QUrl icon;
};
