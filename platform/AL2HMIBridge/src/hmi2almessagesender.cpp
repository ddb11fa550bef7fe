// SPDX-License-Identifier: MIT
#include "hmi2almessagesender.h"

#include "callsender.h"

#include <QCoreApplication>
#include <QPointer>

namespace AL2HMIBridge {

HMI2ALMessageSender::HMI2ALMessageSender()
    : QObject(QCoreApplication::instance())
{
}

HMI2ALMessageSender::~HMI2ALMessageSender() = default;

HMI2ALMessageSender* HMI2ALMessageSender::instance()
{
    static QPointer<HMI2ALMessageSender> sender;
    if (!sender)
        sender = new HMI2ALMessageSender;
    return sender;
}

bool HMI2ALMessageSender::send(const QString& source, const QString& call, const QJsonArray& arguments)
{
    return sendCall(BridgeEndpoint::Messages, source, call, arguments);
}

} // namespace AL2HMIBridge
