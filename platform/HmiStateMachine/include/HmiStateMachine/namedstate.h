// SPDX-License-Identifier: MIT
#pragma once

#include "hmistatemachine_export.h"
#include "identifier.h"

#include <QState>

namespace HmiStateMachine {

/// \brief A state that is found by its name.
///
/// Names should be unique in a machine; of several states with one name StateMachine::findState() gives the first.
/// Owned by its parent state. GUI thread only.
class HMISTATEMACHINE_EXPORT NamedState : public QState
{
    Q_OBJECT
    Q_PROPERTY(QString name READ name CONSTANT)

public:
    /// \brief Owned by \a parent; one child at a time is active.
    explicit NamedState(const Identifier& name, QState* parent = nullptr);
    /// \brief As above, with exclusive or parallel children.
    NamedState(const Identifier& name, QState::ChildMode mode, QState* parent = nullptr);
    ~NamedState() override;

    QString name() const { return m_name; } ///< never changes

protected:
    void onEntry(QEvent* event) override;
    void onExit(QEvent* event) override;

private:
    const Identifier m_name;
};

} // namespace HmiStateMachine
