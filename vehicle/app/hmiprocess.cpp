// SPDX-License-Identifier: MIT
#include "hmiprocess.h"

#include <QProcessEnvironment>

#include <csignal>

namespace {
constexpr int endTime = 5000; ///< milliseconds to end in good order
/// This program takes its ending signals from a descriptor and blocks them otherwise; a program that it starts must not.
class UnblockedSignals
{
public:
    UnblockedSignals()
    {
        sigset_t none;
        sigemptyset(&none);
        ::pthread_sigmask(SIG_SETMASK, &none, &m_blocked);
    }
    ~UnblockedSignals() { ::pthread_sigmask(SIG_SETMASK, &m_blocked, nullptr); }
    Q_DISABLE_COPY(UnblockedSignals)

private:
    sigset_t m_blocked;
};

} // namespace

HmiProcess::HmiProcess(QObject* parent)
    : QObject(parent)
{
    m_process.setProcessChannelMode(QProcess::ForwardedChannels);
    connect(&m_process, &QProcess::errorOccurred, this, [this](QProcess::ProcessError error) {
        if (error == QProcess::FailedToStart)
            Q_EMIT ended(QStringLiteral("%1: %2").arg(m_process.program(), m_process.errorString()));
    });
    connect(&m_process, qOverload<int, QProcess::ExitStatus>(&QProcess::finished), this, [this](int code) {
        Q_EMIT ended(QStringLiteral("%1 ended by itself with %2").arg(m_process.program()).arg(code));
    });
}

HmiProcess::~HmiProcess()
{
    m_process.disconnect(this);
    if (m_process.state() == QProcess::NotRunning)
        return;
    m_process.terminate();
    if (!m_process.waitForFinished(endTime)) {
        m_process.kill();
        m_process.waitForFinished(endTime);
    }
}

void HmiProcess::start(const QStringList& programAndArguments, const QString& directory)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("HMI_BRIDGE_DIR"), directory);
    m_process.setProcessEnvironment(environment);
    const UnblockedSignals unblocked;
    m_process.start(programAndArguments.constFirst(), programAndArguments.mid(1));
}
