// SPDX-License-Identifier: MIT
#include "hmimoduleintegration.h"

#include "identifiertype.h"

namespace HmiCore {

HmiModuleIntegration::HmiModuleIntegration(ModuleType type, QObject* parent)
    : QObject(parent)
    , m_type(type)
{
    registerIdentifierType();
}

HmiModuleIntegration::~HmiModuleIntegration() = default;

QString HmiModuleIntegration::moduleId() const
{
    return moduleName().toUpper();
}

int HmiModuleIntegration::moduleDomain() const
{
    return 0;
}

QUrl HmiModuleIntegration::iconUrl() const
{
    return QUrl(QString());
}

QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>>
HmiModuleIntegration::moduleRootHierarchyTransitions() const
{
    return {};
}

QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>
HmiModuleIntegration::moduleRootHierarchyPopupStates() const
{
    return {};
}

void HmiModuleIntegration::registerTypes() {}

void HmiModuleIntegration::setEnabled(bool arg)
{
    if (m_enabled == arg)
        return;
    m_enabled = arg;
    Q_EMIT enabledChanged(arg);
}

void HmiModuleIntegration::setBlocked(bool arg)
{
    if (m_blocked == arg)
        return;
    m_blocked = arg;
    Q_EMIT blockedChanged(arg);
}

} // namespace HmiCore
