// SPDX-License-Identifier: MIT
#pragma once

#include "hmistatemachine_export.h"
#include "identifier.h"

#include <QAbstractTransition>

namespace HmiStateMachine {

/// \brief A transition that a key signal triggers (StateMachine::sendKeySignal()), such as "Home" or "Back".
///
/// It works while its source state is active. Once published it works from anywhere; a transition for the same signal
/// in a subtree that is active wins over a published one. Owned by its source state. GUI thread only.
class HMISTATEMACHINE_EXPORT KeySignalTransition : public QAbstractTransition
{
    Q_OBJECT
    Q_PROPERTY(QString keySignal READ keySignal CONSTANT)

public:
    /// \brief Works in \a sourceState, which owns it; leads nowhere until setTargetState().
    explicit KeySignalTransition(const Identifier& keySignal, QState* sourceState = nullptr);
    /// \brief As above, and leads to \a target.
    KeySignalTransition(const Identifier& keySignal, QState* sourceState, QAbstractState* target);
    ~KeySignalTransition() override;

    QString keySignal() const { return m_keySignal; } ///< what triggers it

    /// \brief Publishes the transition: its key signal is handled from anywhere in the state tree.
    ///
    /// The transition moves to the outermost state that is always active; with a target, to the region of the target,
    /// so that triggering it leaves the other regions alone. May be called again without effect.
    void makeGloballyAvailable();

protected:
    bool eventTest(QEvent* event) override;
    void onTransition(QEvent* event) override;

private:
    const Identifier m_keySignal;
};

} // namespace HmiStateMachine
