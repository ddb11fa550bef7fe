// SPDX-License-Identifier: MIT
#include "hmimanager.h"

#include "hmimodulerootmodel.h"
#include "identifiertype.h"
#include "logcategories.h"

#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/StateMachine>

#include <QCoreApplication>
#include <QSortFilterProxyModel>

#include <utility>

namespace HmiCore {

HmiManager* HmiManager::instance()
{
    static HmiManager* const manager = new HmiManager(QCoreApplication::instance());
    return manager;
}

HmiManager::HmiManager(QObject* parent)
    : QObject(parent)
    , m_stateMachine(HmiStateMachine::StateMachine::instance())
    , m_moduleModel(new HmiModuleRootModel(this))
{
    registerIdentifierType();
    m_stateMachine->setObjectName(QStringLiteral("State Machine"));
    connect(m_stateMachine, &QStateMachine::stopped, this, &HmiManager::stateMachineStopped);
}

HmiManager::~HmiManager() = default;

void HmiManager::start()
{
    m_stateMachine->start();
}

QString HmiManager::viewDescriptorPath() const
{
    return m_viewDescriptorPath;
}

QString HmiManager::viewPrefix() const
{
    return m_viewPrefix;
}

void HmiManager::setRootHierarchyViews(const QString& viewDescriptorPath, const QString& viewPrefix)
{
    m_viewDescriptorPath = viewDescriptorPath;
    m_viewPrefix = viewPrefix;
}

QString HmiManager::factoryDefaultHomeState() const
{
    return m_factoryDefaultHomeState;
}

void HmiManager::setFactoryDefaultHomeState(QString name)
{
    m_factoryDefaultHomeState = std::move(name);
}

HmiStateMachine::HmiState* HmiManager::modulesRootState() const
{
    return m_modulesRootState;
}

void HmiManager::setModulesRootState(HmiStateMachine::HmiState* state)
{
    if (m_modulesRootState)
        disconnect(m_modulesRootState, &QAbstractState::entered, this, &HmiManager::rootStateActivated);
    m_modulesRootState = state;
    connect(m_modulesRootState, &QAbstractState::entered, this, &HmiManager::rootStateActivated);
}

HmiModuleRootModel* HmiManager::moduleModel() const
{
    return m_moduleModel;
}

QSortFilterProxyModel* HmiManager::sortedModulesModel() const
{
    return m_sortedModulesModel;
}

void HmiManager::setSortedModulesModel(QSortFilterProxyModel* model)
{
    m_sortedModulesModel = model;
}

void HmiManager::reportMasterReset()
{
    Q_EMIT masterResetBegin();
    Q_EMIT masterResetEnd();
}

void HmiManager::stateMachineStopped()
{
    qCWarning(coreLog) << "The state machine has stopped.\n"
                       << "State machine error:" << m_stateMachine->errorString();
}

} // namespace HmiCore
