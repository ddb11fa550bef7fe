// SPDX-License-Identifier: MIT
#pragma once

#include "hmistatemachine_export.h"
#include "identifier.h"
#include "namedstate.h"

#include <QSet>
#include <QStateMachine>

namespace HmiStateMachine {

/// \brief The HMI's hierarchical state machine. GUI thread only.
///
/// Besides what QStateMachine does it finds states by name, takes requests for a state by name, and passes key signals
/// to key-signal transitions.
class HMISTATEMACHINE_EXPORT StateMachine : public QStateMachine
{
    Q_OBJECT

public:
    explicit StateMachine(QObject* parent = nullptr);
    ~StateMachine() override;

    /// \brief The process's machine, made on the first call as a child of the application object.
    ///
    /// After that application object is gone, the next call makes a new one for the next application object.
    static StateMachine* instance();

    /// \brief The state of this name in this machine, or null.
    NamedState* findState(const Identifier& name) const;

    /// \brief Asks for a state by name; it is entered when the machine processes its next events.
    ///
    /// Only the region that holds the state changes: a popup's state does not leave the view's. False, without any
    /// effect, when the machine does not run or has no such state. A state that is active already stays as it is.
    bool requestState(const Identifier& name);

    /// \brief As above, for a state that may have no name.
    bool requestState(QAbstractState* state);

    /// \brief The outermost state above \a state that is active whenever the machine runs; \a state must be in the machine.
    ///
    /// The machine itself, or, below parallel states, the region that holds \a state.
    static QState* regionOf(QAbstractState* state);

public Q_SLOTS:
    /// \brief Offers a key signal to the transitions of the active states, innermost first, then to published ones.
    ///
    /// Without a running machine or a transition for it the signal is dropped.
    void sendKeySignal(const QString& keySignal);

Q_SIGNALS:
    /// \brief A named state is being entered; its own entered() signal follows.
    void stateEntered(HmiStateMachine::NamedState* state);

    /// \brief A named state is being left.
    void stateExited(HmiStateMachine::NamedState* state);

private:
    void makeRequestable(QAbstractState* target);

    QSet<QAbstractState*> m_requestable;
};

} // namespace HmiStateMachine
