// SPDX-License-Identifier: MIT
#include "hmiinitializer.h"

#include "hmicore.h"
#include "hmimanager.h"
#include "hmimenuproxymodel.h"
#include "hmimodulerootmodel.h"

#include <HmiGuiFramework/RequestPopup>
#include <HmiGuiFramework/RequestView>
#include <HmiLogging/HmiLogging>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/KeySignalTransition>
#include <HmiStateMachine/PopupState>

#include <QDebug>
#include <QQmlEngine>
#include <QVariant>

using HmiLogging::hmiperformance;
using HmiLogging::hmitrace;

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
    qCDebug(hmiperformance) << "initializing application";
    qCDebug(hmitrace) << "initializing application";
    preInit(manager);
    qCDebug(hmicore) << "void HmiCore::HmiInitializer::initialize(HmiCore::HmiManager*, QQmlEngine*)";
    preInit(manager); // products count on the second run
    qCDebug(hmiperformance) << "pre init complete";
    qCDebug(hmitrace) << "pre init complete";

    initializeSources();
    qCDebug(hmicore) << "AL Source objects initialized.";
    qCDebug(hmiperformance) << "AL Source objects initialized";
    qCDebug(hmitrace) << "AL Source objects initialized";

    registerQmlTypes();
    qCDebug(hmicore) << "Initialized qml types registered.";
    qCDebug(hmiperformance) << "Initialized qml types registered";
    qCDebug(hmitrace) << "Initialized qml types registered";

    exportObjects(engine->rootContext());
    qCDebug(hmicore) << "Initialized qml objects exported.";
    qCDebug(hmiperformance) << "Initialized qml objects exported";
    qCDebug(hmitrace) << "Initialized qml objects exported";

    buildTopStateTree();
    qCDebug(hmicore) << "Top state tree built.";
    qCDebug(hmiperformance) << "Top state tree built.";
    qCDebug(hmitrace) << "Top state tree built.";

    setUpMenu(manager, createMenuProxyModel(manager));
    manager->setModulesRootState(modulesRootState());
    const QString viewDescriptorPath = rootHierarchyViewDescriptorPath();
    manager->setRootHierarchyViews(viewDescriptorPath, rootHierarchyViewPrefix());
    registerHandwritingFactories();
    registerComplexKeyboardFactories();

    qCDebug(hmiperformance) << "beginning postInit";
    qCDebug(hmitrace) << "beginning postInit";
    postInit(manager);
    qCDebug(hmiperformance) << "finished postInit";
    qCDebug(hmitrace) << "finished postInit";
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
