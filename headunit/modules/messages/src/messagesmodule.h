// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

class IntentTable;
class MessageCenter;
class VehicleNotices;

/// \brief The message centre: texts of the phone, missed calls and what the vehicle has to tell.
class MessagesModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit MessagesModule(QObject* parent);

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
    void showMark() const;

    MessageCenter* const m_center;
    VehicleNotices* const m_notices;
    IntentTable* const m_intents;
};
