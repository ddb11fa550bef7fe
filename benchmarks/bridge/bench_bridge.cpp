// SPDX-License-Identifier: MIT
// What the bridge costs, against a bare socket round trip between two threads in the same run.
#include "bridgepeer.h"
#include "ratios.h"

#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/KeySource>

#include <cstdlib>

using namespace AL2HMIBridge;

namespace {

constexpr int batch = 20000;

void keyLatency(benchmark::State& state)
{
    const int socket = BridgePeer::instance().priority();
    bool arrived = false;
    QObject context;
    QObject::connect(KeySource::instance(), &KeySource::keyEvent, &context, [&arrived] { arrived = true; });
    for (auto _ : state) {
        arrived = false;
        sendKeyLine(socket);
        while (!arrived)
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }
}

/// Time for one of many state messages that come as fast as they are taken.
void stateMessages(benchmark::State& state)
{
    QByteArray lines;
    for (int i = 1; i <= batch; ++i)
        lines += "{\"source\":\"FMTunerSource\",\"state\":{\"frequency\":\"" + QByteArray::number(i)
                 + "\",\"stationName\":\"Harbour FM\",\"signalStrength\":80}}\n";
    const QString last = QString::number(batch);
    const int socket = BridgePeer::instance().messages();
    for (auto _ : state) {
        std::thread sender([&] { sendAll(socket, lines); });
        while (FMTunerSource::instance()->frequency() != last)
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        sender.join();
        state.PauseTiming();
        sendAll(socket, "{\"source\":\"FMTunerSource\",\"state\":{\"frequency\":\"0\"}}\n");
        while (FMTunerSource::instance()->frequency() == last)
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        state.ResumeTiming();
    }
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    measure("socket round trip", bareRoundTrip);
    measure("key latency", keyLatency);
    measure("state messages", stateMessages);
    Ratios ratios;
    ratios.run(argc, argv);
    ratios.row("key: socket to keyEvent / socket round trip", "key latency", "socket round trip", 2);
    ratios.row("one decoded state message / socket round trip", "state messages", "socket round trip", 2, batch);
    std::_Exit(0); // the bridge's threads are running
}
