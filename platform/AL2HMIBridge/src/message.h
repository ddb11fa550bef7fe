// SPDX-License-Identifier: MIT
#pragma once

#include "sourceinfo.h"

#include <vector>

namespace AL2HMIBridge {

struct FieldValue
{
    const Field* field;
    Value value;
};

struct SourceState
{
    const SourceInfo* source;
    std::vector<FieldValue> values;
};

/// What a line, or the connection itself, has to say to the GUI thread.
struct Message
{
    enum Kind { Greeting, State, Event, SnapshotEnd, Snapshot, Connected, Disconnected };

    Kind kind = State;
    BridgeEndpoint::Channel channel = BridgeEndpoint::Messages;
    const SourceInfo* source = nullptr; ///< of State and Event
    const AL2HMIBridge::Event* event = nullptr;
    std::vector<FieldValue> fields;    ///< of State
    std::vector<Value> arguments;      ///< of Event
    std::vector<SourceState> snapshot; ///< of Snapshot; what is not in it is at its default
    int bytes = 0;                     ///< length of the text it came from
};

/// Brings a message to the sources: stores all values, then announces those that changed. GUI thread.
void deliver(Message& message);

/// Puts every source at its defaults. GUI thread.
void resetSources();

} // namespace AL2HMIBridge
