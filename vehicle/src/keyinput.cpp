// SPDX-License-Identifier: MIT
#include "HmiVehicle/keyinput.h"

#include "HmiVehicle/keycatalogue.h"
#include "scheduler.h"

#include <algorithm>
#include <atomic>
#include <cstdlib>
#include <utility>
#include <vector>

namespace HmiVehicle {

KeyInput::Owner KeyInput::newOwner()
{
    static std::atomic<Owner> last{0};
    return ++last;
}

KeyInput::KeyInput(Scheduler& scheduler, Output keyEvent, Output combinationEvent)
    : m_scheduler(scheduler)
    , m_keyEvent(std::move(keyEvent))
    , m_combinationEvent(std::move(combinationEvent))
    , m_longPressTime(KeyCatalogue::instance().longPress())
{
    for (const KeyInfo& key : KeyCatalogue::instance().keys()) {
        if (key.longPress != m_longPressTime)
            m_longPressTimes[key.id] = key.longPress;
        m_repeatIntervals[key.id] = key.repeat;
    }
}

KeyInput::~KeyInput() = default;

bool KeyInput::press(int key, Owner owner)
{
    if (key < 0 || key > largestKey || isDown(key) || int(m_held.size()) >= maximumHeld)
        return false;
    m_held[key] = {owner, false, m_scheduler.after(longPressTime(key), [this, key] { becomeLong(key); })};
    m_keyEvent(key, KeyPressed);
    updateCombinations();
    return true;
}

bool KeyInput::release(int key, Owner owner)
{
    const auto held = m_held.find(key);
    if (held == m_held.end() || held->second.owner != owner)
        return false;
    lift(key);
    return true;
}

void KeyInput::lift(int key)
{
    Held held = m_held.at(key);
    m_held.erase(key);
    m_scheduler.cancel(&held.timer);
    m_keyEvent(key, held.isLong ? KeyLongReleased : KeyShortReleased);
    updateCombinations();
}

void KeyInput::becomeLong(int key)
{
    m_held[key].isLong = true;
    m_keyEvent(key, KeyLongPressed);
    repeatLater(key);
}

void KeyInput::repeatLater(int key)
{
    const int interval = repeatInterval(key);
    m_held[key].timer = interval ? m_scheduler.after(interval,
                                                     [this, key] {
                                                         m_keyEvent(key, KeyStepped);
                                                         repeatLater(key);
                                                     })
                                 : 0;
}

bool KeyInput::turn(int key, int steps, Owner owner)
{
    const KeyInfo* const info = KeyCatalogue::instance().find(key);
    if (steps < 0 && (!info || !info->opposite))
        return false;
    if (steps == 0 || steps > maximumSteps || steps < -maximumSteps)
        return false;
    const int turned = steps > 0 ? key : info->opposite;
    for (int i = 0; i < std::abs(steps); ++i)
        if (!step(turned, owner))
            return false;
    return true;
}

bool KeyInput::step(int key, Owner owner)
{
    const KeyInfo* const info = KeyCatalogue::instance().find(key);
    if (!press(key, owner))
        return false;
    if (info && info->kind == KeyInfo::Rotary)
        m_keyEvent(key, KeyStepped);
    lift(key);
    return true;
}

void KeyInput::releaseAll(Owner owner)
{
    std::vector<int> keys;
    for (const auto& [key, held] : m_held)
        if (held.owner == owner)
            keys.push_back(key);
    for (const int key : keys)
        release(key, owner);
}

void KeyInput::updateCombinations()
{
    for (const KeyCombination& combination : KeyCatalogue::instance().combinations()) {
        Combination& state = m_combinations[combination.id];
        const bool allDown =
            std::all_of(combination.keys.cbegin(), combination.keys.cend(), [this](int key) { return isDown(key); });
        if (!allDown)
            m_scheduler.cancel(&state.timer);
        else if (!state.timer && !state.complete)
            state.timer = m_scheduler.after(combination.hold, [this, &state, id = combination.id] {
                state.timer = 0;
                state.complete = true;
                m_combinationEvent(id, KeyCombined);
            });
        state.complete = state.complete && allDown;
    }
}

void KeyInput::setLongPressTime(int milliseconds)
{
    m_longPressTime = qMax(0, milliseconds);
}

void KeyInput::setLongPressTime(int key, int milliseconds)
{
    m_longPressTimes[key] = qMax(0, milliseconds);
}

void KeyInput::setRepeatInterval(int key, int milliseconds)
{
    m_repeatIntervals[key] = qMax(0, milliseconds);
}

int KeyInput::longPressTime(int key) const
{
    const auto own = m_longPressTimes.find(key);
    return own == m_longPressTimes.end() ? m_longPressTime : own->second;
}

int KeyInput::repeatInterval(int key) const
{
    const auto own = m_repeatIntervals.find(key);
    return own == m_repeatIntervals.end() ? 0 : own->second;
}

} // namespace HmiVehicle
