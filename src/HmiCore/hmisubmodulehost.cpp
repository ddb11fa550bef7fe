// SPDX-License-Identifier: MIT
#include "hmisubmodulehost.h"

namespace HmiCore {

HmiSubmoduleHost::HmiSubmoduleHost(HmiStateMachine::HmiState* hostState, int hostDomain, QObject* parent)
    : QObject(parent)
    , m_hostDomain(hostDomain)
    , m_submoduleHostState(hostState)
    , m_submoduleEntryActionModel(new HmiGuiFramework::HmiActionModel(this))
{
}

HmiSubmoduleHost::~HmiSubmoduleHost() = default;

int HmiSubmoduleHost::hostDomain() const
{
    return m_hostDomain;
}

HmiStateMachine::HmiState* HmiSubmoduleHost::submoduleHostState() const
{
    return m_submoduleHostState;
}

HmiGuiFramework::HmiActionModel* HmiSubmoduleHost::submoduleEntryActionModel() const
{
    return m_submoduleEntryActionModel;
}

void HmiSubmoduleHost::addSubmoduleEntryAction(HmiGuiFramework::HmiAction* action)
{
    m_submoduleEntryActionModel->addChild(action);
}

void HmiSubmoduleHost::sortActionModel()
{
    m_submoduleEntryActionModel->sortActions();
}

} // namespace HmiCore
