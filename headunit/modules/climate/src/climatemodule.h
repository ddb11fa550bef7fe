// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class Climate;
class ClimateNotice;
class IntentTable;

/// \brief The climate control: one screen, and a notice elsewhere when something was changed by a key or an intent.
class ClimateModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit ClimateModule(QObject* parent);

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
    void addKeys();

    Climate* const m_climate;
    ClimateNotice* const m_notice;
    IntentTable* const m_intents;
};
