// SPDX-License-Identifier: MIT
#pragma once

#include "hardkeycontroller.h"
#include "hardkeysources.h"
#include "hmiintentmanager.h"

#include <initializer_list>

/// What the tables of hard keys are made of: keys, conditions, and what can be done.
namespace HmiCore::HardKeyRules {

using namespace AL2HMIBridge;
using namespace HardKeySources;

enum Key : unsigned int {
    SeekDown = 6,
    SeekUp = 7,
    VolumeUp = 8,
    VolumeDown = 9,
    PushToTalk = 10,
    PhonePickUp = 12,
    SourceKey = 13,
    CdKey = 15,
    Preset1 = 22,
    Preset6 = 27,
    TrafficKey = 35,
    Power = 41,
    SatelliteBand = 47,
    Mute = 48,
    PhoneStart = 49,
    PhoneEnd = 50,
    TuneUp = 54,
    TuneDown = 55,
    DisplayKey = 60,
    CombinedSeekLeft = 77,
    CombinedSeekRight = 78,
    WheelPhoneStart = 79,
    WheelPhoneEnd = 80,
    PlayPause = 83,
    WheelSeekDown = 88,
    WheelSeekUp = 89,
    CombinedWheelSeekDown = 90,
    CombinedWheelSeekUp = 91,
    KeyCount
};

enum State { AnyState = -1, Pressed = 0, Stepped = 1, ShortRelease = 2, LongPress = 3, LongRelease = 4, Combined = 5 };

constexpr int systemLogsCombination = 7;

class KeySet
{
public:
    constexpr KeySet(std::initializer_list<unsigned int> keys)
    {
        for (const unsigned int key : keys)
            m_keys[key] = true;
    }
    constexpr bool contains(unsigned int key) const { return key < KeyCount && m_keys[key]; }

private:
    bool m_keys[KeyCount] = {};
};

struct KeyEvent
{
    unsigned int key;
    int state;
};

/// What has to hold for an action; explanations name both as the tables do.
struct Condition
{
    bool (*holds)();
    const char* name;
};

struct Action
{
    void (*perform)(HardKeyController& controller, const KeyEvent& event);
    const char* name;
};

struct Rule
{
    Condition condition;
    Action action;
};

#define WHEN(...)                                                                                                      \
    Condition                                                                                                          \
    {                                                                                                                  \
        []() -> bool { return __VA_ARGS__; }, #__VA_ARGS__                                                             \
    }
#define DO(...)                                                                                                        \
    Action                                                                                                             \
    {                                                                                                                  \
        []([[maybe_unused]] HardKeyController& controller, [[maybe_unused]] const KeyEvent& event) { __VA_ARGS__; },   \
            #__VA_ARGS__                                                                                               \
    }

constexpr Condition always{[] { return true; }, ""};
constexpr Action nothing{[](HardKeyController&, const KeyEvent&) {}, "nothing"};

constexpr auto start = static_cast<XMTunerSource::SeekLongXMStatus>(1);
constexpr auto stop = static_cast<XMTunerSource::SeekLongXMStatus>(0);
constexpr auto cdPlayPauseFirst = static_cast<CDSource::CDStatus>(2);
constexpr auto cdPlayPauseSecond = static_cast<CDSource::CDStatus>(3);

inline GlobalSource& global()
{
    return *GlobalSource::instance();
}

inline FMTunerSource& fm()
{
    return *FMTunerSource::instance();
}

inline XMTunerSource& satellite()
{
    return *XMTunerSource::instance();
}

inline CDSource& cd()
{
    return *CDSource::instance();
}

inline MediaAudioSource& media()
{
    return *MediaAudioSource::instance();
}

/// Tunes to what is tuned, without the digital programme that was lost.
inline void retuneFm()
{
    fm().tune(fm().frequency(), QStringLiteral("-1"));
}

inline int presetOf(const KeyEvent& event)
{
    return int(event.key - Preset1) + 1;
}

inline void setAudioSource(AudioSource source, int instance = -1)
{
    global().setAudioSource(static_cast<GlobalSource::ALAudioSource>(source), instance);
}

inline void request(HmiIntentManager::HmiIntent intent)
{
    HmiIntentManager::instance()->requestAction(intent);
}

template <typename Tuner>
void cancelAnnouncement()
{
    Tuner::instance()->cancelAnnouncement(Tuner::instance()->announcementType());
    request(HmiIntentManager::CancelAnnouncement);
}

template <typename Tuner, AudioSource mode>
void toggleTrafficAnnouncements()
{
    Tuner* const tuner = Tuner::instance();
    tuner->toggleTpSeekInProgress(static_cast<TunerSource::CurrentMode>(mode),
                                  !noted("trafficAnnouncementEnabled", tuner->trafficAnnouncementEnabled()));
}

template <typename Tuner, AudioSource mode>
void recall(int preset)
{
    Tuner::instance()->recallPreset(static_cast<TunerSource::CurrentMode>(mode), preset);
}

template <typename Tuner, AudioSource mode>
void recallPrevious()
{
    const int position = presetPosition<Tuner>();
    recall<Tuner, mode>(position < 2 ? 6 : position - 1);
}

/// A position above the bank goes one up like those in it, without a turn to the first.
template <typename Tuner, AudioSource mode>
void recallNext()
{
    const int position = presetPosition<Tuner>();
    recall<Tuner, mode>(position < 0 || position == 6 ? 1 : position + 1);
}

template <typename Tuner>
void cancelAutoStore()
{
    if (!noted("autoStoreInProgress", Tuner::instance()->autoStoreInProgress()))
        return;
    if (explained)
        explained->note("cancelled the autostore");
    Tuner::instance()->sendAutoStoreCancel();
}

/// True when the rule's condition held, which ends the search for one.
inline bool apply(const Rule& rule, HardKeyController& controller, const KeyEvent& event)
{
    if (!rule.condition.holds())
        return false;
    if (Q_UNLIKELY(explained)) {
        if (rule.condition.holds != always.holds)
            explained->note(rule.condition.name);
        explained->conclude(rule.action.name);
    }
    rule.action.perform(controller, event);
    return true;
}

template <size_t count>
void applyFirst(const Rule (&rules)[count], HardKeyController& controller)
{
    for (const Rule& rule : rules)
        if (apply(rule, controller, KeyEvent()))
            return;
}

} // namespace HmiCore::HardKeyRules
