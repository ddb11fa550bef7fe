// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class IntentTable;
class MediaController;

/// \brief The media player with its library, the CD player, and what a projected phone plays.
class MediaModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit MediaModule(QObject* parent);

    QString moduleName() const override;
    int modulePriority() const override;
    int moduleDomain() const override;
    QString viewDescriptorFile() const override;
    HmiStateMachine::Identifier rootStateIdentifier() const override;
    QUrl iconUrl() const override;
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override;
    void setupRootContext(QQmlContext* rootContext) override;

private:
    MediaController* const m_controller;
    IntentTable* const m_intents;
};
