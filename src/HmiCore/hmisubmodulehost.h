// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <HmiGuiFramework/HmiActionModel>

#include <QObject>

namespace HmiStateMachine {
class HmiState;
}

namespace HmiGuiFramework {
class HmiAction;
}

namespace HmiCore {

/// \brief A state that takes in hosted submodules of a domain, and the menu of their entry actions. GUI thread only.
///
/// Register it with HmiSubmoduleProvider::registerSubmoduleHost().
class HMICORE_EXPORT HmiSubmoduleHost : public QObject
{
    Q_OBJECT
    Q_PROPERTY(HmiGuiFramework::HmiActionModel* submoduleEntryActionModel READ submoduleEntryActionModel CONSTANT)

public:
    /// \brief \a hostState is not owned and must outlive the registration of submodules.
    HmiSubmoduleHost(HmiStateMachine::HmiState* hostState, int hostDomain, QObject* parent);
    ~HmiSubmoduleHost() override;

    int hostDomain() const;                                             ///< as given to the constructor
    HmiStateMachine::HmiState* submoduleHostState() const;              ///< as given to the constructor
    HmiGuiFramework::HmiActionModel* submoduleEntryActionModel() const; ///< the menu; owned by the host

    /// \brief Adds an entry to the menu, which does not own it.
    void addSubmoduleEntryAction(HmiGuiFramework::HmiAction* action);

    /// \brief Sorts the menu.
    void sortActionModel();

private:
    const int m_hostDomain;
    HmiStateMachine::HmiState* const m_submoduleHostState;
    HmiGuiFramework::HmiActionModel* const m_submoduleEntryActionModel;
};

} // namespace HmiCore
