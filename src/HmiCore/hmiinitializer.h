// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <HmiStateMachine/StateLevel>

#include <QList>
#include <QPair>
#include <QString>

QT_BEGIN_NAMESPACE
class QAbstractTransition;
class QObject;
class QQmlContext;
class QQmlEngine;
class QSortFilterProxyModel;
QT_END_NAMESPACE

namespace HmiStateMachine {
class HmiState;
class PopupState;
} // namespace HmiStateMachine

namespace HmiCore {

class HmiManager;

/// \brief The hooks through which a product shapes the system without changing the core. The executable derives from it.
///
/// The executable owns it; it must outlive HmiApplication::initialize(), after which the core does not use it any more.
/// All hooks run in the GUI thread, in the order that initialize() describes. No hook's failure is noticed.
class HMICORE_EXPORT HmiInitializer
{
public:
    HmiInitializer();
    virtual ~HmiInitializer();

    /// \brief Creates the objects that receive the application layer's state.
    virtual void initializeSources() = 0;

    /// \brief Registers the product's QML types.
    virtual void registerQmlTypes();

    /// \brief Publishes the product's objects to QML.
    virtual void exportObjects(QQmlContext* rootContext);

    /// \brief Wires transitions, of the root hierarchy or of a module; null ones are skipped.
    ///
    /// Here, each is published (publishRootHierarchyTransition()), and one that leads to a popup state or an HmiState
    /// loses its target and requests that popup or view from the GUI framework instead. An override replaces all that.
    virtual void connectTransitions(const QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>>& transitions);

    /// \brief Wires popup states, of the root hierarchy or of a module.
    virtual void
    connectPopupStates(const QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>& popupStates) = 0;

    /// \brief Before everything else. Called twice in a row: an override must bear that.
    virtual void preInit(HmiManager* manager);

    /// \brief After everything that initialize() sets up, before the GUI framework and the plugins.
    virtual void postInit(HmiManager* manager);

    /// \brief The last step of the start-up.
    virtual void completeInitialization() = 0;

    /// \brief Builds the top of the state tree.
    virtual void buildTopStateTree() = 0;

    /// \brief The state under which modules create their root states. The state tree owns it.
    virtual HmiStateMachine::HmiState* modulesRootState() = 0;

    /// \brief Path of the root hierarchy's view descriptor; empty for none.
    virtual QString rootHierarchyViewDescriptorPath() = 0;

    /// \brief Prefix of the root hierarchy's views; empty for no views.
    virtual QString rootHierarchyViewPrefix() = 0;

    /// \brief The model that sorts modules for the menu, to be owned by \a parent; an HmiMenuProxyModel unless overridden.
    virtual QSortFilterProxyModel* createMenuProxyModel(QObject* parent);

    /// \brief Registers factories of handwriting recognizers.
    virtual void registerHandwritingFactories();

    /// \brief Registers factories of complex-keyboard engines.
    virtual void registerComplexKeyboardFactories();

    /// \brief Runs the hooks and hands their results to the manager. Called once, by the application.
    ///
    /// The order: preInit() twice, initializeSources(), registerQmlTypes(), exportObjects(), buildTopStateTree(),
    /// createMenuProxyModel(), modulesRootState(), rootHierarchyViewDescriptorPath() and rootHierarchyViewPrefix(),
    /// registerHandwritingFactories(), registerComplexKeyboardFactories(), postInit().
    void initialize(HmiManager* manager, QQmlEngine* engine);

    /// \brief Runs completeInitialization(). Called once, by the application.
    void finalizeInitialization();

    /// \brief Lets the key of a key-signal transition work from anywhere in the state tree; leaves others alone.
    void publishRootHierarchyTransition(QAbstractTransition* transition) const;
};

} // namespace HmiCore
