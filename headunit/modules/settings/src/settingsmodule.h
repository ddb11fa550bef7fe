// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiModuleIntegration>

namespace HmiCore {
class HmiSubmoduleHost;
}
namespace HmiGuiFramework {
class HmiAction;
}
class IntentTable;

/// \brief The settings: pages of its own and a menu in which other modules have pages.
class SettingsModule : public HmiCore::HmiModuleIntegration
{
    Q_OBJECT

public:
    explicit SettingsModule(QObject* parent);

    QString moduleName() const override;
    int modulePriority() const override;
    int moduleDomain() const override;
    QString viewDescriptorFile() const override;
    HmiStateMachine::Identifier rootStateIdentifier() const override;
    QUrl iconUrl() const override;
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) override;
    void setupRootContext(QQmlContext* rootContext) override;

private:
    HmiGuiFramework::HmiAction* addEntry(const char* text, const QString& icon, int order);
    void addPage(const QString& view, const char* text, const QString& icon, int order);
    void addIntent(int intent, const char* text, const QString& icon, int order);

    IntentTable* const m_intents;
    HmiCore::HmiSubmoduleHost* m_host = nullptr;
};
