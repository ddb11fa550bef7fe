// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class IntentTable;
class PhoneController;

/// \brief The phone: contacts, keypad, calls; and its page in the settings.
class PhoneModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit PhoneModule(QObject* parent);

    QString moduleName() const override;
    int modulePriority() const override;
    int moduleDomain() const override;
    QString viewDescriptorFile() const override;
    HmiStateMachine::Identifier rootStateIdentifier() const override;
    QUrl iconUrl() const override;
    QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> moduleRootHierarchyTransitions() const override;
    QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>
    moduleRootHierarchyPopupStates() const override;
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override;
    void setupRootContext(QQmlContext* rootContext) override;

private:
    PhoneController* const m_controller;
    IntentTable* const m_intents;
    QList<HmiStateMachine::PopupState*> m_popups;
    HmiStateMachine::PopupState* m_incomingCall = nullptr;
    QAbstractTransition* m_toIncomingCall = nullptr;
};
