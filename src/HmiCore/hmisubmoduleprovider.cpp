// SPDX-License-Identifier: MIT
#include "hmisubmoduleprovider.h"

#include "hmihostedsubmodule.h"
#include "hmisubmodulefactory.h"
#include "hmisubmodulehost.h"
#include "targetstate.h"

#include <QCoreApplication>

#include <utility>

namespace HmiCore {

HmiSubmoduleProvider* HmiSubmoduleProvider::instance()
{
    static HmiSubmoduleProvider* const provider = new HmiSubmoduleProvider(QCoreApplication::instance());
    return provider;
}

HmiSubmoduleProvider::HmiSubmoduleProvider(QObject* parent)
    : QObject(parent)
{
}

HmiSubmoduleProvider::~HmiSubmoduleProvider() = default;

bool HmiSubmoduleProvider::requestSubmodule(int submoduleDomain, HmiStateMachine::HmiLayeredState* state,
                                            const QString& viewName, int domain)
{
    const TargetState target(state, viewName, domain);
    if (HmiSubmoduleFactory* const factory = m_factories.value(submoduleDomain)) {
        factory->createSubmodule(target);
        return true;
    }
    m_pendingRequests[submoduleDomain].append(target);
    return false;
}

void HmiSubmoduleProvider::registerSubmoduleFactory(int submoduleDomain, HmiSubmoduleFactory* factory)
{
    if (!factory)
        return;
    m_factories.insert(submoduleDomain, factory);
    // Taken first: what is built may itself request submodules and register factories.
    const QList<TargetState> pending = m_pendingRequests.take(submoduleDomain);
    for (const TargetState& target : pending)
        factory->createSubmodule(target);
}

void HmiSubmoduleProvider::registerHostedSubmodule(int hostDomain, HmiHostedSubmodule* submodule)
{
    if (!submodule)
        return;
    m_hostedSubmodules[hostDomain].append(submodule);
    if (HmiSubmoduleHost* const host = m_hosts.value(hostDomain))
        build(submodule, host);
}

void HmiSubmoduleProvider::registerSubmoduleHost(int hostDomain, HmiSubmoduleHost* host)
{
    if (!host)
        return;
    m_hosts.insert(hostDomain, host);
    const QList<HmiHostedSubmodule*> submodules = m_hostedSubmodules.value(hostDomain);
    for (HmiHostedSubmodule* const submodule : submodules)
        build(submodule, host);
}

void HmiSubmoduleProvider::sortHostedModuleEntryActions()
{
    for (HmiSubmoduleHost* const host : std::as_const(m_hosts))
        host->sortActionModel();
}

QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> HmiSubmoduleProvider::rootHierarchyTransitions() const
{
    return m_rootHierarchyTransitions;
}

QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>
HmiSubmoduleProvider::rootHierarchyPopupStates() const
{
    return m_rootHierarchyPopupStates;
}

void HmiSubmoduleProvider::build(HmiHostedSubmodule* submodule, HmiSubmoduleHost* host)
{
    submodule->createSubmodule(host);
    m_rootHierarchyTransitions += submodule->createRootHierarchyTransitions();
    m_rootHierarchyPopupStates += submodule->createRootHierarchyPopupStates();
}

} // namespace HmiCore
