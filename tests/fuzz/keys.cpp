// SPDX-License-Identifier: MIT
// Hard keys in any state of the vehicle, with handlers of intents that come, refuse and go: each leads to what a walk through
// the documented rules leads to.
#include "forgottenintents.h"
#include "fuzzing.h"

#include "expectedkeycalls.h"
#include "keyjournal.h"
#include "keyworldshown.h"

#include <memory>

using namespace AL2HMIBridge;
using namespace HmiCore;
using Fuzzing::check;
using Fuzzing::Input;

namespace {

constexpr int logCombination = 7;
constexpr int combined = 5;

/// Numbers that a source can say, the interesting ones more often than others.
int number(Input& input, std::initializer_list<int> usual, int least)
{
    const int choice = input.below(8);
    if (choice < 7)
        return usual.begin()[choice % int(usual.size())];
    const int any = input.integer();
    return any < least ? least : any;
}

void change(Input& input, KeyWorld& world)
{
    constexpr int least = -2147483647 - 1;
    static int KeyWorld::*const switches[] = {
        &KeyWorld::eventsBlocked, &KeyWorld::incomingCall,    &KeyWorld::callConnected, &KeyWorld::privateMode,
        &KeyWorld::siriSupported, &KeyWorld::siriEnabled,     &KeyWorld::siriActive,    &KeyWorld::phoneVoiceService,
        &KeyWorld::spokenText,    &KeyWorld::recogniserReady, &KeyWorld::valetMode,     &KeyWorld::diagnostics,
    };
    static int KeyWorld::*const numbers[] = {
        &KeyWorld::hdSignalLoss,   &KeyWorld::replay,        &KeyWorld::satellitePlays,
        &KeyWorld::projectionMode, &KeyWorld::projectedCall, &KeyWorld::voiceSession,
    };
    switch (input.below(5)) {
    case 0:
        world.mainAudioSource = number(input, {0, 1, 2, 3, 4, 16, 34}, least);
        return;
    case 1:
        world.*switches[input.below(int(std::size(switches)))] = input.yes() ? 1 : 0;
        return;
    case 2:
        world.*numbers[input.below(int(std::size(numbers)))] = input.below(4);
        return;
    case 3:
        world.cdStatus = input.below(4);
        return;
    default: {
        KeyWorld::Tuner& tuner = world.tuners[size_t(input.below(4))];
        tuner.autoStoreInProgress = input.yes() ? 1 : 0;
        tuner.trafficAnnouncementEnabled = input.yes() ? 1 : 0;
        tuner.announcementType = input.below(4);
        tuner.activePreset = int8_t(input.byte());
        tuner.activePresetBank = input.below(16);
        return;
    }
    }
}

/// Handles the intents of keys too, or refuses to, until it is deleted.
class Bystander : public HmiIntentHandler
{
public:
    explicit Bystander(Input& input)
        : m_performs(input.yes())
    {
        for (const int intent : {HmiIntentManager::PhoneSiriNotEnabled, HmiIntentManager::CancelAnnouncement,
                                 HmiIntentManager::RequestDisplayToggle})
            addAction(intent);
    }

    bool performAction(int, const QList<QVariant>&, bool, const QVariant&) override { return m_performs; }

private:
    const bool m_performs;
};

void toggle(std::unique_ptr<Bystander>& bystander, Input& input)
{
    bystander = bystander ? nullptr : std::make_unique<Bystander>(input);
    if (bystander)
        HmiIntentManager::instance()->registerIntentHandler(bystander.get());
}

void press(Input& input, const KeyWorld& world, KeyJournal& journal)
{
    const int choice = input.below(16);
    const int key = choice < 15 ? input.below(100) : input.integer();
    const int state = choice < 14 ? input.below(6) : input.integer();
    Q_EMIT KeySource::instance()->keyEvent(key, state);
    const QStringList done = journal.take();
    const QStringList expected = expectedKeyCalls(unsigned(key), state, world);
    check(done == expected, "a key does what the rules say",
          QStringLiteral("key %1 state %2: %3 instead of %4")
              .arg(key)
              .arg(state)
              .arg(done.join(QLatin1String("; ")), expected.join(QLatin1String("; "))));
}

void combine(Input& input, KeyJournal& journal)
{
    const int combination = input.below(16);
    const int state = input.below(8);
    Q_EMIT KeySource::instance()->keyComboEvent(combination, state);
    const bool captures = combination == logCombination && state == combined;
    check(journal.take()
              == (captures ? QStringList(QStringLiteral("GlobalSource.captureSystemLogs()")) : QStringList()),
          "one combination takes the logs");
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    static BridgeTester tester;
    static KeyJournal journal;
    BridgeTester::resetState();
    journal.take();
    Fuzzing::forgetIntents();
    HmiIntentManager::instance()->registerIntentHandler(&journal);
    std::unique_ptr<Bystander> bystander;
    KeyWorld world;
    KeyWorld defaults;
    defaults.mainAudioSource = -1;
    defaults.recogniserReady = 0;
    BridgeTester::setState("FMTunerSource", {{"frequency", QStringLiteral("98.5")}});
    check(showKeyWorld(world, defaults), "the sources say what they are told");

    Input input(data, size);
    while (!input.atEnd()) {
        const KeyWorld before = world;
        switch (input.below(8)) {
        case 0:
        case 1:
        case 2:
            change(input, world);
            check(showKeyWorld(world, before), "the sources say what they are told");
            break;
        case 3:
            combine(input, journal);
            break;
        case 4:
            toggle(bystander, input);
            break;
        default:
            press(input, world, journal);
        }
    }
    return 0;
}
