// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class IntentTable;
class Navigator;
class TurnAnnouncer;

/// \brief The navigation: map, destinations, guidance; its page in the settings, and turns told on other screens.
class NavigationModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit NavigationModule(QObject* parent);

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
    Navigator* const m_navigator;
    TurnAnnouncer* const m_announcer;
    IntentTable* const m_intents;
};
