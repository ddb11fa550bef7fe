// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <map>

namespace HmiVehicle {

class Scheduler;

/// \brief Key states as on the wire.
enum KeyState : int {
    KeyPressed = 0,
    KeyStepped = 1,
    KeyShortReleased = 2,
    KeyLongPressed = 3,
    KeyLongReleased = 4,
    KeyCombined = 5
};

/// \brief Turns what fingers do into the key states of the protocol, on the vehicle's own time. The vehicle's thread only.
///
/// A key that goes down is KeyPressed. When it comes up before the long-press time it is KeyShortReleased; otherwise it is
/// KeyLongPressed when that time is over and KeyLongReleased when it comes up. Keys that repeat are KeyStepped while they
/// are held longer. Keys that are held together for their time complete a combination.
///
/// Panels, keyboards, devices and scripts are owners. A press belongs to its owner until its release: meanwhile nobody else
/// can press or release that key.
class KeyInput
{
public:
    using Owner = int;

    /// \brief A number that no other owner has. Any thread.
    static Owner newOwner();

    static constexpr int largestKey = 65535;
    static constexpr int maximumHeld = 64; ///< keys that can be down at the same time
    static constexpr int maximumSteps = 1000;

    using Output = std::function<void(int id, int state)>;

    /// \brief For the vehicle: \a keyEvent and \a combinationEvent receive what is sent; \a scheduler outlives this.
    KeyInput(Scheduler& scheduler, Output keyEvent, Output combinationEvent);
    ~KeyInput();
    KeyInput(const KeyInput&) = delete;
    KeyInput& operator=(const KeyInput&) = delete;

    /// \brief \a key, of the catalogue or not, goes down.
    ///
    /// False, and nothing happens, when it is down already, out of 0 to largestKey, or too many keys are down.
    bool press(int key, Owner owner);

    /// \brief It comes up. False, and nothing happens, unless \a owner holds it.
    bool release(int key, Owner owner);

    /// \brief A dial goes \a steps steps further; below 0 it is the key's opposite that steps.
    ///
    /// A step of a rotary key is KeyPressed, KeyStepped, KeyShortReleased; other keys are pressed shortly once a step. False,
    /// and nothing happens, for a key that is down or out of range, for a step the other way of a key without an opposite, and
    /// for 0 or more than maximumSteps steps.
    bool turn(int key, int steps, Owner owner);

    /// \brief \a owner is gone: its keys come up, as held so far.
    void releaseAll(Owner owner);

    bool isDown(int key) const { return m_held.count(key) != 0; }

    /// \name Timing, in milliseconds; for presses from now on
    /// @{
    /// \brief For all keys without a time of their own.
    void setLongPressTime(int milliseconds);
    void setLongPressTime(int key, int milliseconds);
    /// \brief How often \a key repeats while it is held; 0 for never.
    void setRepeatInterval(int key, int milliseconds);
    int longPressTime(int key) const;
    int repeatInterval(int key) const;
    /// @}

private:
    struct Held
    {
        Owner owner;
        bool isLong = false;
        int timer = 0;
    };
    struct Combination
    {
        bool complete = false;
        int timer = 0;
    };

    void lift(int key);
    void becomeLong(int key);
    void repeatLater(int key);
    void updateCombinations();
    bool step(int key, Owner owner);

    Scheduler& m_scheduler;
    const Output m_keyEvent;
    const Output m_combinationEvent;
    std::map<int, Held> m_held;
    std::map<int, Combination> m_combinations;
    std::map<int, int> m_longPressTimes; ///< of keys that have their own
    std::map<int, int> m_repeatIntervals;
    int m_longPressTime;
};

} // namespace HmiVehicle
