// SPDX-License-Identifier: MIT
#include "messagehandler.h"

#include "dltbackend.h"

#include <QByteArray>

#include <atomic>
#include <chrono>
#include <cstdio>

namespace HmiLogging {

namespace {

std::atomic<bool> dltStarted{false};
QtMessageHandler previousHandler = nullptr;

double secondsSinceStart()
{
    static const auto start = std::chrono::steady_clock::now();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

char letterOf(QtMsgType type)
{
    switch (type) {
    case QtDebugMsg:
        return 'D';
    case QtInfoMsg:
        return 'I';
    case QtWarningMsg:
        return 'W';
    case QtCriticalMsg:
        return 'C';
    case QtFatalMsg:
        return 'F';
    }
    return '?';
}

void handle(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    const QByteArray line = MessageHandler::format(secondsSinceStart(), type, context, message).toLocal8Bit() + '\n';
    std::fwrite(line.constData(), 1, size_t(line.size()), stderr);
    if (dltStarted)
        DltBackend::write(type, context.category, message);
}

} // namespace

MessageHandler::MessageHandler(const QString& applicationId)
{
    secondsSinceStart();
    dltStarted = DltBackend::start(applicationId.toLatin1());
    previousHandler = qInstallMessageHandler(handle);
}

MessageHandler::~MessageHandler()
{
    qInstallMessageHandler(previousHandler);
    if (dltStarted.exchange(false))
        DltBackend::stop();
}

bool MessageHandler::dltActive() const
{
    return dltStarted;
}

QString MessageHandler::format(double seconds, QtMsgType type, const QMessageLogContext& context,
                               const QString& message)
{
    return QStringLiteral("[%1] %2 %3: %4")
        .arg(seconds, 12, 'f', 6)
        .arg(QLatin1Char(letterOf(type)))
        .arg(QLatin1String(context.category ? context.category : "default"), message);
}

} // namespace HmiLogging
