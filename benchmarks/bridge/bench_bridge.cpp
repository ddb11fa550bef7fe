// SPDX-License-Identifier: MIT
// What the bridge costs, as ratios to a bare socket round trip between two threads in the same run.
#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/BridgeEndpoint>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/MessageReceivePriorityQueueThread>
#include <AL2HMIBridge/MessageReceiveThread>

#include <QCoreApplication>

#include <benchmark/benchmark.h>

#include <array>
#include <cstdio>
#include <map>
#include <memory>
#include <string>
#include <sys/socket.h>
#include <thread>
#include <unistd.h>

using namespace AL2HMIBridge;

namespace {

constexpr int batch = 20000;
constexpr char keyLine[] = "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,0]}\n";

void sendAll(int socket, const QByteArray& bytes)
{
    for (qint64 sent = 0; sent < bytes.size();) {
        const auto count = ::send(socket, bytes.constData() + sent, size_t(bytes.size() - sent), MSG_NOSIGNAL);
        if (count <= 0)
            return;
        sent += count;
    }
}

/// The bridge with its peers' ends of the connections.
class Bridge
{
public:
    Bridge()
    {
        for (int channel = 0; channel < 2; ++channel)
            if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, m_pairs[size_t(channel)].data()) != 0)
                qFatal("no sockets");
        BridgeEndpoint::setConnector(
            [this](BridgeEndpoint::Channel channel) { return ::dup(m_pairs[size_t(channel)][0]); });
        MessageReceiveThread::createInstance(&m_owner)->begin();
        MessageReceivePriorityQueueThread::createInstance(&m_owner)->begin();
        const QByteArray greeting("{\"protocol\":1,\"peer\":\"application-layer\"}\n");
        sendAll(messages(), greeting + "{\"snapshot\":\"complete\"}\n");
        sendAll(priority(), greeting);
        const BridgeConnection* const connection = BridgeConnection::instance();
        while (!connection->synchronised() || !connection->channelConnected(BridgeEndpoint::Priority))
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }

    int messages() const { return m_pairs[0][1]; }
    int priority() const { return m_pairs[1][1]; }

private:
    std::array<std::array<int, 2>, 2> m_pairs;
    QObject m_owner;
};

Bridge& bridge()
{
    static Bridge* const instance = new Bridge; // the threads end with the process
    return *instance;
}

void bareRoundTrip(benchmark::State& state)
{
    int pair[2];
    if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, pair) != 0)
        return state.SkipWithError("no sockets");
    std::thread echo([socket = pair[1]] {
        char buffer[256];
        for (ssize_t count; (count = ::recv(socket, buffer, sizeof buffer, 0)) > 0;)
            if (::send(socket, buffer, size_t(count), MSG_NOSIGNAL) != count)
                return;
    });
    char buffer[256];
    for (auto _ : state) {
        sendAll(pair[0], QByteArray::fromRawData(keyLine, sizeof keyLine - 1));
        benchmark::DoNotOptimize(::recv(pair[0], buffer, sizeof buffer, 0));
    }
    ::shutdown(pair[0], SHUT_RDWR);
    echo.join();
    ::close(pair[0]);
    ::close(pair[1]);
}

void keyLatency(benchmark::State& state)
{
    const int socket = bridge().priority();
    bool arrived = false;
    QObject context;
    QObject::connect(KeySource::instance(), &KeySource::keyEvent, &context, [&arrived] { arrived = true; });
    for (auto _ : state) {
        arrived = false;
        sendAll(socket, QByteArray::fromRawData(keyLine, sizeof keyLine - 1));
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
    const int socket = bridge().messages();
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
    state.SetItemsProcessed(state.iterations() * batch);
}

/// Keeps the best time of each benchmark, in nanoseconds.
class RatioReporter : public benchmark::ConsoleReporter
{
public:
    void ReportRuns(const std::vector<Run>& runs) override
    {
        ConsoleReporter::ReportRuns(runs);
        for (const Run& run : runs) {
            if (run.run_type != Run::RT_Iteration || run.error_occurred)
                continue;
            double& best = m_best[run.run_name.function_name];
            const double time = run.GetAdjustedRealTime() / benchmark::GetTimeUnitMultiplier(run.time_unit) * 1e9;
            best = best > 0 ? std::min(best, time) : time;
        }
    }

    void printRatios() const
    {
        const double bare = at("socket round trip");
        if (bare <= 0)
            return;
        const double perMessage = at("state messages") / batch;
        std::printf("\n%-34s %10s %8s\n", "against a bare socket round trip", "ns", "ratio");
        std::printf("%-34s %10.0f %8.2f\n", "socket round trip", bare, 1.0);
        std::printf("%-34s %10.0f %8.2f\n", "key: socket to keyEvent", at("key latency"), at("key latency") / bare);
        std::printf("%-34s %10.0f %8.2f\n", "one decoded state message", perMessage, perMessage / bare);
    }

private:
    double at(const char* name) const
    {
        const auto found = m_best.find(name);
        return found == m_best.end() ? 0 : found->second;
    }

    std::map<std::string, double> m_best;
};

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 1;
    benchmark::RegisterBenchmark("socket round trip", bareRoundTrip)->UseRealTime()->Repetitions(5);
    benchmark::RegisterBenchmark("key latency", keyLatency)->UseRealTime()->Repetitions(5);
    benchmark::RegisterBenchmark("state messages", stateMessages)->UseRealTime()->Repetitions(5);
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.printRatios();
    std::fflush(stdout);
    std::_Exit(0); // the bridge's threads are running
}
