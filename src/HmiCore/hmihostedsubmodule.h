// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <HmiStateMachine/StateLevel>

#include <QList>
#include <QObject>
#include <QPair>
#include <QString>

QT_BEGIN_NAMESPACE
class QAbstractTransition;
QT_END_NAMESPACE

namespace HmiStateMachine {
class HmiState;
class PopupState;
} // namespace HmiStateMachine

namespace HmiGuiFramework {
class HmiAction;
}

namespace HmiCore {

class HmiSubmoduleHost;

/// \brief A submodule that is built into every host of a domain and shows up in its menu. Modules derive from it.
///
/// Register it with HmiSubmoduleProvider::registerHostedSubmodule(). GUI thread only.
class HMICORE_EXPORT HmiHostedSubmodule : public QObject
{
    Q_OBJECT

public:
    explicit HmiHostedSubmodule(QObject* parent = nullptr);
    ~HmiHostedSubmodule() override;

    /// \brief Transitions that lead into the submodule from anywhere; none unless overridden. Not owned by the caller.
    virtual QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> createRootHierarchyTransitions();

    /// \brief Popups of the submodule that may come up anywhere; none unless overridden. Not owned by the caller.
    virtual QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>> createRootHierarchyPopupStates();

    /// \brief The entry of the host's menu that leads into the submodule. Not owned by the caller.
    virtual HmiGuiFramework::HmiAction* entryAction() = 0;

    /// \brief Prefix under which the submodule's views are loaded.
    virtual QString moduleId() const = 0;

    /// \brief Name for log lines.
    virtual QString submoduleName() const = 0;

    /// \brief View descriptor that is loaded for each host; empty for none.
    virtual QString viewDescriptorFile() const = 0;

    /// \brief Builds the submodule's states into the host's state.
    virtual void create(HmiStateMachine::HmiState* hostState) = 0;

    /// \brief Loads the views, if there is a view manager, builds the states and adds the entry action to the host.
    ///
    /// A host state that contains the submodule already is refused with a warning.
    void createSubmodule(HmiSubmoduleHost* host);

private:
    QList<QString> m_createdIn;
};

} // namespace HmiCore
