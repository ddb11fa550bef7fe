// SPDX-License-Identifier: MIT
#include "hmihostedsubmodule.h"

#include "hmisubmodulehost.h"
#include "logcategories.h"

#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiState>

namespace HmiCore {

HmiHostedSubmodule::HmiHostedSubmodule(QObject* parent)
    : QObject(parent)
{
}

HmiHostedSubmodule::~HmiHostedSubmodule() = default;

QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> HmiHostedSubmodule::createRootHierarchyTransitions()
{
    return {};
}

QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>
HmiHostedSubmodule::createRootHierarchyPopupStates()
{
    return {};
}

void HmiHostedSubmodule::createSubmodule(HmiSubmoduleHost* host)
{
    const QString name = host->submoduleHostState()->name();
    if (m_createdIn.contains(name)) {
        qCWarning(coreLog) << "Submodule creation skipped," << name << "already contains" << submoduleName();
        return;
    }
    auto* const viewManager =
        HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"));
    if (viewManager && !viewDescriptorFile().isEmpty())
        viewManager->loadModule(viewDescriptorFile(), moduleId(), host->hostDomain());
    create(host->submoduleHostState());
    host->addSubmoduleEntryAction(entryAction());
    m_createdIn.append(name);
    qCDebug(coreLog) << submoduleName() << "Created in" << name;
}

} // namespace HmiCore
