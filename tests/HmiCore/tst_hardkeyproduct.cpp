// SPDX-License-Identifier: MIT
#include "expectedkeycalls.h"
#include "keyjournal.h"
#include "keyworldshown.h"
#include "logcapture.h"

#include <QTest>

#include <functional>
#include <optional>
#include <vector>

using namespace AL2HMIBridge;
using namespace HmiCore;

namespace {

constexpr unsigned int allOnes = 0xffffffffU;

/// One thing that is varied: where it is kept, and its values.
struct Dimension
{
    std::function<int&(KeyWorld& world)> field;
    std::vector<int> values;
};

Dimension dimension(int KeyWorld::*field, std::vector<int> values = {0, 1})
{
    return {[field](KeyWorld& world) -> int& { return world.*field; }, std::move(values)};
}

Dimension dimension(size_t tuner, int KeyWorld::Tuner::*field, std::vector<int> values = {0, 1})
{
    return {[tuner, field](KeyWorld& world) -> int& { return world.tuners[tuner].*field; }, std::move(values)};
}

const std::vector<int> allSources{-1, 0, 1, 2, 3, 4, 5, 12, 16, 34, 35};
const std::vector<int> allStates{-1, 0, 1, 2, 3, 4, 5, 6};

std::vector<unsigned int> allKeys()
{
    std::vector<unsigned int> keys;
    for (unsigned int key = 0; key <= 100; ++key)
        keys.push_back(key);
    keys.insert(keys.end(), {200U, allOnes});
    return keys;
}

} // namespace

Q_DECLARE_METATYPE(std::vector<unsigned int>)
Q_DECLARE_METATYPE(std::vector<Dimension>)

class HardKeyProductTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<BridgeTester> bridge;
    std::optional<KeyJournal> journal;
    KeyWorld shown; // what the sources say

    void show(const KeyWorld& world)
    {
        QVERIFY(showKeyWorld(world, shown));
        shown = world;
    }

private Q_SLOTS:
    void init()
    {
        log.emplace();
        bridge.emplace();
        if (!journal)
            journal.emplace();
        shown = KeyWorld();
        BridgeTester::setState("GlobalSource", {{"mainAudioSource", shown.mainAudioSource}});
        BridgeTester::setState("SpeechSource", {{"voiceRecognitionEngineReady", true}});
        BridgeTester::setState("FMTunerSource", {{"frequency", QStringLiteral("98.5")}});
    }
    void cleanup()
    {
        bridge.reset();
        log.reset();
    }
    void cleanupTestCase() { journal.reset(); }

    void everyCombination_data()
    {
        using W = KeyWorld;
        using T = KeyWorld::Tuner;
        constexpr size_t am = 0;
        constexpr size_t fm = 1;
        constexpr size_t dab = 3;
        const std::vector<int> positions{-1, 0, 1, 2, 5, 6, 7, 8, 11, 12, 13, 18};
        const std::vector<unsigned int> projectable{12, 49, 50, 77, 78, 79, 80, 90, 91};

        QTest::addColumn<std::vector<unsigned int>>("keys");
        QTest::addColumn<std::vector<Dimension>>("dimensions");
        QTest::newRow("all keys on all sources")
            << allKeys()
            << std::vector<Dimension>{dimension(&W::mainAudioSource, allSources), dimension(&W::hdSignalLoss),
                                      dimension(&W::replay), dimension(&W::projectionMode, {0, 2}),
                                      dimension(&W::valetMode)};
        QTest::newRow("what a press cancels")
            << allKeys()
            << std::vector<Dimension>{dimension(&W::voiceSession, {0, 3}), dimension(&W::spokenText),
                                      dimension(am, &T::autoStoreInProgress), dimension(fm, &T::autoStoreInProgress),
                                      dimension(&W::projectionMode)};
        QTest::newRow("push-to-talk") << std::vector<unsigned int>{
            10} << std::vector<Dimension>{dimension(&W::valetMode),     dimension(&W::incomingCall),
                                          dimension(&W::callConnected), dimension(&W::recogniserReady),
                                          dimension(&W::diagnostics),   dimension(&W::voiceSession, {0, 1, 2}),
                                          dimension(&W::siriSupported), dimension(&W::siriEnabled),
                                          dimension(&W::siriActive),    dimension(&W::phoneVoiceService),
                                          dimension(&W::projectionMode)};
        QTest::newRow("keys shared with the projected phone")
            << projectable
            << std::vector<Dimension>{
                   dimension(&W::projectionMode), dimension(&W::mainAudioSource, {0, 1, 2, 4, 16, 34, 35}),
                   dimension(&W::eventsBlocked),  dimension(&W::incomingCall),
                   dimension(&W::callConnected),  dimension(&W::privateMode),
                   dimension(&W::projectedCall),  dimension(&W::replay),
                   dimension(&W::hdSignalLoss)};
        QTest::newRow("traffic key") << std::vector<unsigned int>{35}
                                     << std::vector<Dimension>{dimension(&W::mainAudioSource, allSources),
                                                               dimension(am, &T::announcementType, {0, 1, 7}),
                                                               dimension(fm, &T::announcementType, {0, 1, 7}),
                                                               dimension(dab, &T::announcementType, {0, 1, 7}),
                                                               dimension(am, &T::trafficAnnouncementEnabled),
                                                               dimension(fm, &T::trafficAnnouncementEnabled),
                                                               dimension(dab, &T::trafficAnnouncementEnabled)};
        QTest::newRow("play and pause") << std::vector<unsigned int>{83}
                                        << std::vector<Dimension>{dimension(&W::mainAudioSource, allSources),
                                                                  dimension(&W::cdStatus, {0, 1, 2, 3}),
                                                                  dimension(&W::satellitePlays, {0, 1, 2}),
                                                                  dimension(&W::projectionMode)};
        const char* const tuners[] = {"AM presets", "FM presets", "satellite presets", "DAB presets"};
        for (size_t i = 0; i < std::size(tuners); ++i)
            QTest::newRow(tuners[i]) << std::vector<unsigned int>{47, 88, 89, 90, 91}
                                     << std::vector<Dimension>{dimension(&W::mainAudioSource, {int(i), 16}),
                                                               dimension(&W::projectionMode),
                                                               dimension(&W::hdSignalLoss),
                                                               dimension(&W::replay),
                                                               dimension(i, &T::activePreset, positions),
                                                               dimension(i, &T::activePresetBank, {0, 1, 2})};
    }

    void everyCombination()
    {
        QFETCH(std::vector<unsigned int>, keys);
        QFETCH(std::vector<Dimension>, dimensions);
        KeyWorld world;
        size_t combinations = 1;
        for (const Dimension& dimension : dimensions)
            combinations *= dimension.values.size();
        for (size_t combination = 0; combination < combinations; ++combination) {
            size_t rest = combination;
            for (const Dimension& dimension : dimensions) {
                dimension.field(world) = dimension.values[rest % dimension.values.size()];
                rest /= dimension.values.size();
            }
            show(world);
            for (const unsigned int key : keys) {
                for (const int state : allStates) {
                    Q_EMIT KeySource::instance()->keyEvent(int(key), state);
                    const QStringList done = journal->take();
                    const QStringList expected = expectedKeyCalls(key, state, world);
                    if (done != expected)
                        QFAIL(qPrintable(
                            QStringLiteral(
                                "key %1 state %2, combination %3 of this row, source %4: did [%5], expected [%6]")
                                .arg(key)
                                .arg(state)
                                .arg(combination)
                                .arg(world.mainAudioSource)
                                .arg(done.join(QLatin1String("; ")), expected.join(QLatin1String("; ")))));
                }
            }
        }
        qInfo("%zu combinations", combinations * keys.size() * allStates.size());
    }

    /// The rest of the world must not matter: every key in worlds drawn at random.
    void randomWorlds()
    {
        uint seed = 20231;
        const auto draw = [&seed](uint below) {
            seed = seed * 1664525U + 1013904223U;
            return int((seed >> 8) % below);
        };
        for (int i = 0; i < 20000; ++i) {
            KeyWorld world;
            world.mainAudioSource = allSources[size_t(draw(uint(allSources.size())))];
            for (int KeyWorld::*field :
                 {&KeyWorld::hdSignalLoss, &KeyWorld::replay, &KeyWorld::satellitePlays, &KeyWorld::projectionMode,
                  &KeyWorld::projectedCall, &KeyWorld::eventsBlocked, &KeyWorld::incomingCall, &KeyWorld::callConnected,
                  &KeyWorld::privateMode, &KeyWorld::siriSupported, &KeyWorld::siriEnabled, &KeyWorld::siriActive,
                  &KeyWorld::phoneVoiceService, &KeyWorld::voiceSession, &KeyWorld::spokenText,
                  &KeyWorld::recogniserReady, &KeyWorld::valetMode, &KeyWorld::diagnostics})
                world.*field = draw(2);
            world.cdStatus = draw(4);
            for (KeyWorld::Tuner& tuner : world.tuners)
                tuner = {draw(2), draw(3), draw(2), draw(20) - 1, draw(3)};
            show(world);
            for (int sample = 0; sample < 10; ++sample) {
                const auto key = unsigned(draw(95));
                const int state = draw(7);
                Q_EMIT KeySource::instance()->keyEvent(int(key), state);
                QCOMPARE(journal->take(), expectedKeyCalls(key, state, world));
            }
        }
    }
};

QTEST_GUILESS_MAIN(HardKeyProductTest)
#include "tst_hardkeyproduct.moc"
