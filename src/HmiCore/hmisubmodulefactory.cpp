// SPDX-License-Identifier: MIT
#include "hmisubmodulefactory.h"

#include "logcategories.h"
#include "targetstate.h"

#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiLayeredState>

namespace HmiCore {

HmiSubmoduleFactory::HmiSubmoduleFactory(QObject* parent)
    : QObject(parent)
{
}

HmiSubmoduleFactory::~HmiSubmoduleFactory() = default;

void HmiSubmoduleFactory::createSubmodule(const TargetState& target)
{
    if (m_createdIn.contains(target.state->name())) {
        qCWarning(coreLog) << "Submodule creation skipped," << target.viewName << "already contains" << submoduleName();
        return;
    }
    auto* const viewManager =
        HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"));
    if (viewManager && !viewDescriptorFile().isEmpty())
        viewManager->loadModule(viewDescriptorFile(), target.viewName, target.domain);
    create(target);
    m_createdIn.append(target.viewName); // not the state's name: modules rely on being built twice under other names
    qCDebug(coreLog) << submoduleName() << "Created in" << target.viewName;
}

} // namespace HmiCore
