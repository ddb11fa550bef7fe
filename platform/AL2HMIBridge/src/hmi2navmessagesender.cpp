// SPDX-License-Identifier: MIT
#include "hmi2navmessagesender.h"

#include "callsender.h"

#include <QCoreApplication>
#include <QPointer>

namespace AL2HMIBridge {

HMI2NAVMessageSender::HMI2NAVMessageSender()
    : QObject(QCoreApplication::instance())
{
}

HMI2NAVMessageSender::~HMI2NAVMessageSender() = default;

HMI2NAVMessageSender* HMI2NAVMessageSender::instance()
{
    static QPointer<HMI2NAVMessageSender> sender;
    if (!sender)
        sender = new HMI2NAVMessageSender;
    return sender;
}

bool HMI2NAVMessageSender::send(const QString& source, const QString& call, const QJsonArray& arguments)
{
    return sendCall(BridgeEndpoint::Touch, source, call, arguments);
}

} // namespace AL2HMIBridge
