// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiHostedSubmodule>

/// \brief The phone's page in the settings.
class PhoneSettings : public HmiCore::HmiHostedSubmodule
{
    Q_OBJECT

public:
    explicit PhoneSettings(QObject* parent);

    HmiGuiFramework::HmiAction* entryAction() override;
    QString moduleId() const override;
    QString submoduleName() const override;
    QString viewDescriptorFile() const override;
    void create(HmiStateMachine::HmiState* hostState) override;

private:
    HmiGuiFramework::HmiAction* const m_entryAction;
};
