// SPDX-License-Identifier: MIT
// Requests for intents against the look-up, the guarded pointer and the virtual call that they cannot do without.
#include "ratios.h"

#include <HmiCore/HmiIntentHandler>
#include <HmiCore/HmiIntentManager>

#include <QCoreApplication>
#include <QMutex>

#include <memory>

using namespace HmiCore;

namespace {

constexpr int withOne = HmiIntentManager::UserType + 1;
constexpr int withThree = HmiIntentManager::UserType + 3;

class Handler : public HmiIntentHandler
{
public:
    explicit Handler(int intent) { addAction(intent); }
    bool performAction(int, const QList<QVariant>&, bool, const QVariant&) override { return ++m_count != 0; }

private:
    unsigned int m_count = 0;
};

/// The limit: the same hash, mutex and calls, and nothing else.
class BareRouter
{
public:
    void add(HmiIntentHandler* handler)
    {
        const QList<int> intents = handler->handledActions();
        for (const int intent : intents)
            m_handlers.insert(intent, handler);
    }

    bool request(int intent, const QList<QVariant>& data)
    {
        const QMutexLocker locker(&m_mutex);
        bool handled = false;
        for (auto entry = m_handlers.constFind(intent); entry != m_handlers.constEnd() && entry.key() == intent;
             ++entry)
            if (HmiIntentHandler* const handler = entry.value())
                handled |= handler->performAction(intent, data, false, QVariant());
        return handled;
    }

private:
    QMultiHash<int, QPointer<HmiIntentHandler>> m_handlers;
    QMutex m_mutex;
};

/// Two implementations, so that the compiler cannot guess which one is called.
struct Plain
{
    virtual ~Plain() = default;
    virtual bool enabled() const = 0;
};

struct Always : Plain
{
    bool enabled() const override { return true; }
};

struct Sometimes : Plain
{
    bool enabled() const override { return m_enabled; }
    bool m_enabled = true;
};

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    HmiIntentManager* const manager = HmiIntentManager::instance();
    BareRouter bare;
    std::vector<std::unique_ptr<Handler>> handlers;
    for (const int intent : {withOne, withThree, withThree, withThree}) {
        handlers.push_back(std::make_unique<Handler>(intent));
        manager->registerIntentHandler(handlers.back().get());
        bare.add(handlers.back().get());
    }
    const QList<QVariant> data{1, 2};
    const QVariant noEvent;

    for (const int intent : {withOne, withThree}) {
        measure(intent == withOne ? "bare, 1" : "bare, 3", [&, intent](benchmark::State& state) {
            for (auto _ : state)
                benchmark::DoNotOptimize(bare.request(intent, data));
        });
        measure(intent == withOne ? "request, 1" : "request, 3", [&, intent](benchmark::State& state) {
            for (auto _ : state)
                benchmark::DoNotOptimize(manager->requestAction(intent, data, false, false, noEvent));
        });
    }
    const HmiIntentMonitor* monitor = manager->intentMonitor(withThree);
    const Always always;
    const Sometimes sometimes;
    const Plain* plain = argc > 1000 ? static_cast<const Plain*>(&always) : &sometimes;
    measure("monitor", [&](benchmark::State& state) {
        for (auto _ : state) {
            benchmark::DoNotOptimize(monitor);
            benchmark::DoNotOptimize(monitor->enabled());
        }
    });
    measure("virtual", [&](benchmark::State& state) {
        for (auto _ : state) {
            benchmark::DoNotOptimize(plain);
            benchmark::DoNotOptimize(plain->enabled());
        }
    });

    Ratios ratios;
    ratios.run(argc, argv);
    ratios.row("requestAction, 1 handler / bare look-up and call", "request, 1", "bare, 1", 2.5);
    ratios.row("requestAction, 3 handlers / bare look-up and calls", "request, 3", "bare, 3", 2.5);
    ratios.row("a monitor's enabled / a virtual call", "monitor", "virtual", 2);
}
