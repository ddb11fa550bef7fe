// SPDX-License-Identifier: MIT
#include "message.h"

#include "bridgeconnection.h"

#include <QPointer>

#include <algorithm>

namespace AL2HMIBridge {

namespace {

struct Change
{
    QPointer<QObject> source;
    const Field* field;
};

void announce(const std::vector<Change>& changes)
{
    for (const Change& change : changes)
        if (change.source) // a listener may have ended the application
            change.field->notify(change.source);
}

void deliverState(Message& message)
{
    QObject* const source = message.source->instance();
    std::vector<Change> changes;
    for (FieldValue& entry : message.fields)
        if (entry.field->store(source, entry.value))
            changes.push_back({source, entry.field});
    announce(changes);
}

FieldValue* findValue(std::vector<SourceState>& snapshot, const SourceInfo* source, const Field* field)
{
    for (SourceState& state : snapshot) {
        if (state.source != source)
            continue;
        const auto found = std::find_if(state.values.begin(), state.values.end(),
                                        [field](const FieldValue& value) { return value.field == field; });
        return found == state.values.end() ? nullptr : &*found;
    }
    return nullptr;
}

void deliverSnapshot(Message& message)
{
    std::vector<Change> changes;
    for (const SourceInfo* const info : SourceTable::all()) {
        if (!info->fields.count && !info->base)
            continue;
        QObject* const source = info->instance();
        SourceTable::forEachField(*info, [&](const Field& field) {
            FieldValue* const received = findValue(message.snapshot, info, &field);
            Value initial = field.initial();
            if (field.store(source, received ? received->value : initial))
                changes.push_back({source, &field});
        });
    }
    announce(changes);
}

void deliverEvent(const Message& message)
{
    if (QObject* const receiver = message.source->instance())
        message.event->emitTo(receiver, message.arguments);
}

} // namespace

void resetSources()
{
    Message nothing;
    deliverSnapshot(nothing);
}

void deliver(Message& message)
{
    switch (message.kind) {
    case Message::State:
        return deliverState(message);
    case Message::Snapshot:
        deliverSnapshot(message);
        return BridgeConnection::instance()->setSynchronised(true);
    case Message::Event:
        return deliverEvent(message);
    case Message::Connected:
        return BridgeConnection::instance()->setConnected(message.channel, true);
    case Message::Disconnected:
        return BridgeConnection::instance()->setConnected(message.channel, false);
    case Message::Greeting:
    case Message::SnapshotEnd:
        return; // the reader keeps these to itself
    }
}

} // namespace AL2HMIBridge
