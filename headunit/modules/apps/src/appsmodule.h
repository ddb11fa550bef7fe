// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class IntentTable;
class ProjectionOverride;
class ProjectionPresence;

/// \brief All apps: the phone that projects its screen, and the modules of the head unit.
class AppsModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit AppsModule(QObject* parent);

    QString moduleName() const override;
    int modulePriority() const override;
    int moduleDomain() const override;
    QString viewDescriptorFile() const override;
    HmiStateMachine::Identifier rootStateIdentifier() const override;
    QUrl iconUrl() const override;
    void registerTypes() override;
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override;
    void setupRootContext(QQmlContext* rootContext) override;

private:
    ProjectionPresence* const m_presence;
    ProjectionOverride* const m_override;
    IntentTable* const m_intents;
};
