// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractTransition>
#include <QEvent>

namespace HmiStateMachine {

/// What StateMachine::requestState() posts to the machine. The target is compared, never followed.
struct StateRequestEvent : public QEvent
{
    explicit StateRequestEvent(const QAbstractState* state)
        : QEvent(eventType())
        , target(state)
    {
    }

    static QEvent::Type eventType()
    {
        static const auto type = QEvent::Type(QEvent::registerEventType());
        return type;
    }

    const QAbstractState* const target;
};

/// One way to a requested state. Every ancestor of a requestable state up to its region has one; the machine takes that
/// of the innermost active ancestor, so that states common to the old and the new place are neither left nor entered.
class StateRequestTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    StateRequestTransition(QState* source, QAbstractState* target);

protected:
    bool eventTest(QEvent* event) override;
    void onTransition(QEvent* event) override;
};

} // namespace HmiStateMachine
