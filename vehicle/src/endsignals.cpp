// SPDX-License-Identifier: MIT
#include <HmiVehicle/endsignals.h>

#include <QCoreApplication>

#include <csignal>
#include <sys/signalfd.h>
#include <unistd.h>

namespace HmiVehicle {

namespace {

int openSignals()
{
    sigset_t signalsToEnd;
    sigemptyset(&signalsToEnd);
    sigaddset(&signalsToEnd, SIGINT);
    sigaddset(&signalsToEnd, SIGTERM);
    ::pthread_sigmask(SIG_BLOCK, &signalsToEnd, nullptr);
    return ::signalfd(-1, &signalsToEnd, SFD_CLOEXEC | SFD_NONBLOCK);
}

} // namespace

EndSignals::EndSignals()
    : m_descriptor(openSignals())
{
}

EndSignals::~EndSignals()
{
    m_notifier.reset();
    ::close(m_descriptor);
}

void EndSignals::quitEventLoop()
{
    m_notifier = std::make_unique<QSocketNotifier>(m_descriptor, QSocketNotifier::Read);
    QObject::connect(m_notifier.get(), &QSocketNotifier::activated, QCoreApplication::instance(),
                     &QCoreApplication::quit);
}

} // namespace HmiVehicle
