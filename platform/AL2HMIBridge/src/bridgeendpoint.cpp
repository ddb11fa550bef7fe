// SPDX-License-Identifier: MIT
#include "bridgeendpoint.h"

#include <QDir>

#include <mutex>
#include <unistd.h>
#include <utility>

namespace AL2HMIBridge {

namespace {

struct Settings
{
    std::mutex mutex;
    QString directory;
    BridgeEndpoint::Connector connector;
};

Settings& settings()
{
    static Settings instance;
    return instance;
}

QString defaultDirectory()
{
    const QString named = qEnvironmentVariable("HMI_BRIDGE_DIR");
    if (!named.isEmpty())
        return named;
    const QString runtime = qEnvironmentVariable("XDG_RUNTIME_DIR");
    if (!runtime.isEmpty())
        return runtime + QStringLiteral("/hmi-bridge");
    return QDir::tempPath() + QStringLiteral("/hmi-bridge-%1").arg(::geteuid());
}

} // namespace

QString BridgeEndpoint::channelName(Channel channel)
{
    switch (channel) {
    case Messages:
        return QStringLiteral("messages");
    case Priority:
        return QStringLiteral("priority");
    case Touch:
        return QStringLiteral("touch");
    }
    return QString();
}

QString BridgeEndpoint::directory()
{
    const std::lock_guard<std::mutex> lock(settings().mutex);
    return settings().directory.isEmpty() ? defaultDirectory() : settings().directory;
}

void BridgeEndpoint::setDirectory(const QString& directory)
{
    const std::lock_guard<std::mutex> lock(settings().mutex);
    settings().directory = directory;
}

void BridgeEndpoint::setConnector(Connector connector)
{
    const std::lock_guard<std::mutex> lock(settings().mutex);
    settings().connector = std::move(connector);
}

BridgeEndpoint::Connector BridgeEndpoint::connector()
{
    const std::lock_guard<std::mutex> lock(settings().mutex);
    return settings().connector;
}

} // namespace AL2HMIBridge
