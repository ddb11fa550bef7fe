// SPDX-License-Identifier: MIT
#include "forgottenintents.h"

#include <HmiCore/HmiIntentHandler>
#include <HmiCore/HmiIntentManager>

using namespace HmiCore;

namespace {

/// An explicit instantiation may name what is private.
template <typename Tag, typename Tag::Type member>
struct Opened
{
    friend typename Tag::Type open(Tag) { return member; }
};

struct Handlers
{
    using Type = QMultiHash<int, QPointer<HmiIntentHandler>> HmiIntentManager::*;
    friend Type open(Handlers);
};

struct Monitors
{
    using Type = QHash<int, QPointer<HmiIntentMonitor>> HmiIntentManager::*;
    friend Type open(Monitors);
};

template struct Opened<Handlers, &HmiIntentManager::m_handlers>;
template struct Opened<Monitors, &HmiIntentManager::m_monitors>;

} // namespace

void Fuzzing::forgetIntents()
{
    HmiIntentManager* const manager = HmiIntentManager::instance();
    const auto monitors = manager->*open(Monitors());
    for (const QPointer<HmiIntentMonitor>& monitor : monitors)
        delete monitor.data();
    manager->*open(Monitors()) = {};
    manager->*open(Handlers()) = {};
}
