// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class ConditionalPopup;
class IntentTable;
class RadioController;

/// \brief The radio: bands, stations and presets. It is home after a factory reset.
class RadioModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit RadioModule(QObject* parent);

    QString moduleName() const override;
    int modulePriority() const override;
    int moduleDomain() const override;
    QString viewDescriptorFile() const override;
    HmiStateMachine::Identifier rootStateIdentifier() const override;
    QUrl iconUrl() const override;
    QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>
    moduleRootHierarchyPopupStates() const override;
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override;
    void setupRootContext(QQmlContext* rootContext) override;

private:
    RadioController* const m_controller;
    ConditionalPopup* const m_announcement;
    IntentTable* const m_intents;
    HmiStateMachine::PopupState* m_announcementState = nullptr;
};
