// SPDX-License-Identifier: MIT
#include "hmiinitializer.h"

#include "hmimanager.h"
#include "hmimenuproxymodel.h"
#include "hmimodulerootmodel.h"
#include "logcategories.h"

#include <HmiGuiFramework/RequestPopup>
#include <HmiGuiFramework/RequestView>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/KeySignalTransition>
#include <HmiStateMachine/PopupState>

#include <QQmlEngine>
#include <QVariant>

namespace HmiCore {

namespace {

void setUpMenu(HmiManager* manager, QSortFilterProxyModel* menu)
{
    menu->setSourceModel(manager->moduleModel());
    menu->setSortRole(HmiModuleRootModel::ModulePriority);
    menu->setDynamicSortFilter(true);
    menu->sort(0, Qt::AscendingOrder);
    manager->setSortedModulesModel(menu);
}

// The state is no longer the transition's target but what the GUI framework is asked for, which then enters it.
void requestInsteadOfEntering(QAbstractTransition* transition)
{
    QAbstractState* const target = transition->targetState();
    if (auto* const popup = qobject_cast<HmiStateMachine::PopupState*>(target)) {
        transition->setTargetState(nullptr);
        QObject::connect(transition, &QAbstractTransition::triggered, transition,
                         HmiGuiFramework::RequestPopup(popup, QVariant()));
    } else if (auto* const view = qobject_cast<HmiStateMachine::HmiState*>(target)) {
        transition->setTargetState(nullptr);
        QObject::connect(transition, &QAbstractTransition::triggered, transition,
                         HmiGuiFramework::RequestView(view->name(), QVariant(), false, QVariant()));
    }
}

} // namespace

HmiInitializer::HmiInitializer() = default;
HmiInitializer::~HmiInitializer() = default;

void HmiInitializer::registerQmlTypes() {}

void HmiInitializer::exportObjects(QQmlContext* rootContext)
{
    Q_UNUSED(rootContext)
}

void HmiInitializer::connectTransitions(
    const QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>>& transitions)
{
    for (const auto& [level, transition] : transitions) {
        if (!transition)
            continue;
        publishRootHierarchyTransition(transition);
        requestInsteadOfEntering(transition);
    }
}

void HmiInitializer::preInit(HmiManager* manager)
{
    Q_UNUSED(manager)
}

void HmiInitializer::postInit(HmiManager* manager)
{
    Q_UNUSED(manager)
}

QSortFilterProxyModel* HmiInitializer::createMenuProxyModel(QObject* parent)
{
    return new HmiMenuProxyModel(parent);
}

void HmiInitializer::registerHandwritingFactories() {}

void HmiInitializer::registerComplexKeyboardFactories() {}

void HmiInitializer::initialize(HmiManager* manager, QQmlEngine* engine)
{
    qCDebug(performanceLog) << "initializing application";
    qCDebug(traceLog) << "initializing application";
    preInit(manager);
    qCDebug(coreLog) << "void HmiCore::HmiInitializer::initialize(HmiCore::HmiManager*, QQmlEngine*)";
    preInit(manager); // products count on the second run
    qCDebug(performanceLog) << "pre init complete";
    qCDebug(traceLog) << "pre init complete";

    initializeSources();
    qCDebug(coreLog) << "AL Source objects initialized.";
    qCDebug(performanceLog) << "AL Source objects initialized";
    qCDebug(traceLog) << "AL Source objects initialized";

    registerQmlTypes();
    qCDebug(coreLog) << "Initialized qml types registered.";
    qCDebug(performanceLog) << "Initialized qml types registered";
    qCDebug(traceLog) << "Initialized qml types registered";

    exportObjects(engine->rootContext());
    qCDebug(coreLog) << "Initialized qml objects exported.";
    qCDebug(performanceLog) << "Initialized qml objects exported";
    qCDebug(traceLog) << "Initialized qml objects exported";

    buildTopStateTree();
    qCDebug(coreLog) << "Top state tree built.";
    qCDebug(performanceLog) << "Top state tree built.";
    qCDebug(traceLog) << "Top state tree built.";

    setUpMenu(manager, createMenuProxyModel(manager));
    manager->setModulesRootState(modulesRootState());
    const QString viewDescriptorPath = rootHierarchyViewDescriptorPath();
    manager->setRootHierarchyViews(viewDescriptorPath, rootHierarchyViewPrefix());
    registerHandwritingFactories();
    registerComplexKeyboardFactories();

    qCDebug(performanceLog) << "beginning postInit";
    qCDebug(traceLog) << "beginning postInit";
    postInit(manager);
    qCDebug(performanceLog) << "finished postInit";
    qCDebug(traceLog) << "finished postInit";
}

void HmiInitializer::finalizeInitialization()
{
    completeInitialization();
}

void HmiInitializer::publishRootHierarchyTransition(QAbstractTransition* transition) const
{
    if (auto* const keySignal = qobject_cast<HmiStateMachine::KeySignalTransition*>(transition))
        keySignal->makeGloballyAvailable();
}

} // namespace HmiCore
