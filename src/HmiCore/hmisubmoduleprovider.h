// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <HmiStateMachine/StateLevel>

#include <QHash>
#include <QList>
#include <QObject>
#include <QPair>
#include <QString>

QT_BEGIN_NAMESPACE
class QAbstractTransition;
QT_END_NAMESPACE

namespace HmiStateMachine {
class HmiLayeredState;
class PopupState;
} // namespace HmiStateMachine

namespace HmiCore {

class HmiHostedSubmodule;
class HmiSubmoduleFactory;
class HmiSubmoduleHost;
struct TargetState;

/// \brief Brings submodules together with the modules that show them, in whatever order both turn up.
///
/// Modules register here while they are set up. Nothing is ever unregistered, and nothing registered is owned: it must
/// live as long as the provider. Null is ignored. GUI thread only.
class HMICORE_EXPORT HmiSubmoduleProvider : public QObject
{
    Q_OBJECT

public:
    /// \brief The one provider, made on the first call as a child of the application object and gone with it.
    static HmiSubmoduleProvider* instance();
    ~HmiSubmoduleProvider() override;

    /// \brief Asks for the submodule of \a submoduleDomain to be built into \a state.
    ///
    /// Its views are loaded under \a viewName and \a domain. True when it was built at once, false when its factory is
    /// not there yet and the request waits for it.
    bool requestSubmodule(int submoduleDomain, HmiStateMachine::HmiLayeredState* state, const QString& viewName,
                          int domain);

    /// \brief Sets the factory of a domain, in place of an earlier one, and serves the requests that wait for it.
    void registerSubmoduleFactory(int submoduleDomain, HmiSubmoduleFactory* factory);

    /// \brief Adds a submodule to a host domain; it is built now or when the host is registered.
    void registerHostedSubmodule(int hostDomain, HmiHostedSubmodule* submodule);

    /// \brief Sets the host of a domain, in place of an earlier one, and builds all submodules of the domain into it.
    void registerSubmoduleHost(int hostDomain, HmiSubmoduleHost* host);

    /// \brief Sorts the menus of all hosts.
    void sortHostedModuleEntryActions();

    /// \brief The transitions of all hosted submodules, once per building or refused building.
    QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> rootHierarchyTransitions() const;

    /// \brief The popup states of all hosted submodules, once per building or refused building.
    QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>> rootHierarchyPopupStates() const;

private:
    explicit HmiSubmoduleProvider(QObject* parent);
    void build(HmiHostedSubmodule* submodule, HmiSubmoduleHost* host);

    QHash<int, QList<TargetState>> m_pendingRequests;
    QHash<int, HmiSubmoduleFactory*> m_factories;
    QHash<int, QList<HmiHostedSubmodule*>> m_hostedSubmodules;
    QHash<int, HmiSubmoduleHost*> m_hosts;
    QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> m_rootHierarchyTransitions;
    QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>> m_rootHierarchyPopupStates;
};

} // namespace HmiCore
