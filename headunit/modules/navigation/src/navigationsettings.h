// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiHostedSubmodule>

/// \brief The navigation's page in the settings.
class NavigationSettings : public HmiCore::HmiHostedSubmodule
{
    Q_OBJECT

public:
    explicit NavigationSettings(QObject* parent);

    HmiGuiFramework::HmiAction* entryAction() override;
    QString moduleId() const override;
    QString submoduleName() const override;
    QString viewDescriptorFile() const override;
    void create(HmiStateMachine::HmiState* hostState) override;

private:
    HmiGuiFramework::HmiAction* const m_entryAction;
};
