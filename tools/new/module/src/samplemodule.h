// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class Counter;

/// \brief What the head unit asks about the module: name, place in the launcher, states, views.
class SampleModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit SampleModule(QObject* parent);

    QString moduleName() const override;
    int modulePriority() const override;
    int moduleDomain() const override;
    QString viewDescriptorFile() const override;
    HmiStateMachine::Identifier rootStateIdentifier() const override;
    QUrl iconUrl() const override;
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override;
    void setupRootContext(QQmlContext* rootContext) override;

private:
    void registerTranslation();

    Counter* const m_counter;
};
