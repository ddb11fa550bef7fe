// SPDX-License-Identifier: MIT
// Hard keys: the decision alone, against a signal and a switch; the whole way, against a bare socket round trip.
#include "bridgepeer.h"
#include "ratios.h"

#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <HmiCore/HardKeyController>

#include <atomic>
#include <chrono>
#include <cstdlib>
#include <poll.h>
#include <sys/eventfd.h>

using namespace AL2HMIBridge;

namespace {

constexpr int seekUp = 7;
constexpr int seekUpLongReleased = 4;
constexpr int batch = 200;

/// The limit: what dispatch costs that knows nothing of the vehicle.
class SwitchOnKeys : public QObject
{
    Q_OBJECT

public:
    SwitchOnKeys() { connect(this, &SwitchOnKeys::keyEvent, this, &SwitchOnKeys::onKey); }

Q_SIGNALS:
    void keyEvent(int keyId, int keyState);

private:
    void onKey(int keyId, int keyState)
    {
        if (keyState != seekUpLongReleased)
            return;
        switch (keyId) {
        case 6:
            return GlobalSource::instance()->sendLongReleasedSeekDown();
        case seekUp:
            return GlobalSource::instance()->sendLongReleasedSeekUp();
        case 8:
            return GlobalSource::instance()->sendLongReleasedVolumeUpKey();
        case 9:
            return GlobalSource::instance()->sendLongReleasedVolumeDownKey();
        case 54:
            return GlobalSource::instance()->sendLongReleasedTuneUpKey();
        case 55:
            return GlobalSource::instance()->sendLongReleasedTuneDownKey();
        default:
            return;
        }
    }
};

/// Sends keys with a bridge that keeps the calls; emptying it is not timed.
template <typename Emitter>
void emitKeys(benchmark::State& state, Emitter* emitter, int key, int keyState)
{
    const BridgeTester bridge;
    for (auto _ : state) {
        const auto start = std::chrono::steady_clock::now();
        for (int i = 0; i < batch; ++i)
            Q_EMIT emitter->keyEvent(key, keyState);
        state.SetIterationTime(std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count());
        BridgeTester::takeCalls();
    }
}

/// From the key on one socket to the call on the other, both at the peer's end.
void keyToCall(benchmark::State& state)
{
    const BridgePeer& bridge = BridgePeer::instance();
    sendAll(bridge.messages(), "{\"source\":\"GlobalSource\",\"state\":{\"mainAudioSource\":1}}\n");
    while (GlobalSource::instance()->mainAudioSource() != 1)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    bridge.skipSent();
    std::thread peer([&] {
        char buffer[4096];
        for (auto _ : state) {
            sendKeyLine(bridge.priority());
            benchmark::DoNotOptimize(::recv(bridge.messages(), buffer, sizeof buffer, 0));
        }
        QMetaObject::invokeMethod(QCoreApplication::instance(), &QCoreApplication::quit, Qt::QueuedConnection);
    });
    QCoreApplication::exec();
    peer.join();
}

/// The hops of a key without anything done in between: a socket, a thread that wakes another, a socket.
void bareRelay(benchmark::State& state)
{
    int in[2];
    int out[2];
    const int woken = ::eventfd(0, EFD_CLOEXEC);
    if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, in) != 0
        || ::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, out) != 0 || woken < 0)
        return state.SkipWithError("no sockets");
    std::thread receiver([&] {
        char buffer[256];
        for (pollfd wait{in[1], POLLIN, 0}; ::poll(&wait, 1, -1) == 1 && ::recv(in[1], buffer, sizeof buffer, 0) > 0;)
            if (::eventfd_write(woken, 1) != 0)
                return;
    });
    std::atomic<bool> done{false};
    std::thread handler([&] {
        eventfd_t count = 0;
        for (pollfd wait{woken, POLLIN, 0}; ::poll(&wait, 1, -1) == 1 && ::eventfd_read(woken, &count) == 0 && !done;)
            sendKeyLine(out[1]);
    });
    char buffer[256];
    for (auto _ : state) {
        sendKeyLine(in[0]);
        benchmark::DoNotOptimize(::recv(out[0], buffer, sizeof buffer, 0));
    }
    done = true;
    sendKeyLine(in[0]);
    handler.join();
    ::shutdown(in[0], SHUT_RDWR);
    receiver.join();
    for (const int descriptor : {in[0], in[1], out[0], out[1], woken})
        ::close(descriptor);
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    HmiCore::HardKeyController::instance();
    SwitchOnKeys limit;
    KeySource* const keys = KeySource::instance();

    measureManually("switch and call",
                    [&](benchmark::State& state) { emitKeys(state, &limit, seekUp, seekUpLongReleased); });
    measureManually("decision and call",
                    [&](benchmark::State& state) { emitKeys(state, keys, seekUp, seekUpLongReleased); });
    measureManually("switch", [&](benchmark::State& state) { emitKeys(state, &limit, 89, 0); });
    measureManually("decision", [&](benchmark::State& state) { emitKeys(state, keys, 89, 0); });
    measure("socket round trip", bareRoundTrip);
    measure("relay", bareRelay);
    measure("key to call", keyToCall);

    Ratios ratios;
    ratios.run(argc, argv);
    ratios.row("200 keys to platform calls / signal, switch and calls", "decision and call", "switch and call", 3);
    ratios.row("200 keys that lead to nothing / signal and switch", "decision", "switch");
    ratios.row("key on a socket to call on a socket / round trip", "key to call", "socket round trip", 2);
    ratios.row("key on a socket to call on a socket / its hops, bare", "key to call", "relay");
    std::_Exit(0); // the bridge's threads are running
}

#include "bench_keys.moc"
