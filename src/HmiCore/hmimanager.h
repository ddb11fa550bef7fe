// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <HmiStateMachine/Identifier>

#include <QObject>
#include <QString>

QT_BEGIN_NAMESPACE
class QSortFilterProxyModel;
QT_END_NAMESPACE

namespace HmiStateMachine {
class HmiState;
class StateMachine;
} // namespace HmiStateMachine

namespace HmiCore {

class HmiModuleRootModel;

/// \brief The process-wide hub between the core, the modules and QML. GUI thread only.
///
/// It keeps what the start-up found out and relays application-wide events as signals. Signals without a sender in the
/// core may be emitted by whoever knows of the event.
class HMICORE_EXPORT HmiManager : public QObject
{
    Q_OBJECT

public:
    /// \brief The one manager, made on the first call as a child of the application object.
    ///
    /// The application object must exist, and the manager goes with it: not to be called after its end.
    static HmiManager* instance();
    ~HmiManager() override;

    /// \brief Starts the state machine.
    void start();

    QString viewDescriptorPath() const; ///< of the root hierarchy; empty until set
    QString viewPrefix() const;         ///< of the root hierarchy's views; empty until set

    /// \brief Sets where the root hierarchy's views come from and what prefix they get.
    void setRootHierarchyViews(const QString& viewDescriptorPath, const QString& viewPrefix);

    QString factoryDefaultHomeState() const; ///< name of the state that is home after a factory reset; empty until set
    void setFactoryDefaultHomeState(QString name);

    HmiStateMachine::HmiState*
    modulesRootState() const; ///< parent of all modules' root states; null until set, not owned

    /// \brief Sets the parent of all modules' root states, which must not be null; rootStateActivated() follows it.
    void setModulesRootState(HmiStateMachine::HmiState* state);

    HmiModuleRootModel* moduleModel() const; ///< the modules, not sorted; owned by the manager

    QSortFilterProxyModel*
    sortedModulesModel() const; ///< the modules as the menu shows them; null until set, not owned
    void setSortedModulesModel(QSortFilterProxyModel* model);

Q_SIGNALS:
    /// \brief The HMI is about to be suspended.
    void hmiSuspend();

    /// \brief The root state of this name, of a module that is not blacklisted, was entered.
    void moduleRootStateActivated(const HmiStateMachine::Identifier& name);

    /// \brief The root state of a blacklisted module was entered.
    void blacklistedModuleRootStateEntered();

    /// \brief The modules root state was entered.
    void rootStateActivated();

    /// \brief The window is on the screen; themes may synchronise.
    void hmiThemeSync();

    /// \brief A palette is completely in force.
    void hmiPaletteChange(const QString& paletteId);

    /// \brief All texts are in the new language.
    void hmiRetranslated();

    /// \brief To be emitted when the UI may appear: the application shows the window.
    void showHmiUI();

    /// \brief Listeners reset themselves to factory defaults inside their handlers of this signal.
    void masterResetBegin();

    /// \brief All handlers of masterResetBegin() have returned.
    void masterResetEnd();

public Q_SLOTS:
    /// \brief Emits masterResetBegin(), then masterResetEnd().
    void reportMasterReset();

private Q_SLOTS:
    void stateMachineStopped();

private:
    explicit HmiManager(QObject* parent);

    HmiStateMachine::StateMachine* const m_stateMachine;
    HmiStateMachine::HmiState* m_modulesRootState = nullptr;
    QString m_viewDescriptorPath;
    QString m_viewPrefix;
    QString m_factoryDefaultHomeState;
    HmiModuleRootModel* const m_moduleModel;
    QSortFilterProxyModel* m_sortedModulesModel = nullptr;
};

} // namespace HmiCore
