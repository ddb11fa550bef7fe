// SPDX-License-Identifier: MIT
#pragma once

#include <QEvent>
#include <QString>

namespace HmiStateMachine {

/// What StateMachine::sendKeySignal() posts to the machine.
struct KeySignalEvent : public QEvent
{
    explicit KeySignalEvent(const QString& signal)
        : QEvent(eventType())
        , keySignal(signal)
    {
    }

    static QEvent::Type eventType()
    {
        static const auto type = QEvent::Type(QEvent::registerEventType());
        return type;
    }

    const QString keySignal;
};

} // namespace HmiStateMachine
