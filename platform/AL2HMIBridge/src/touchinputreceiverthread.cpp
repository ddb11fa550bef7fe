// SPDX-License-Identifier: MIT
#include "touchinputreceiverthread.h"

#include "hmi2navmessagesender.h"

#include <QJsonArray>
#include <QPointer>

namespace AL2HMIBridge {

namespace {
const QString wireName = QStringLiteral("TouchInput");

QPointer<TouchInputReceiverThread>& newest()
{
    static QPointer<TouchInputReceiverThread> s_newest;
    return s_newest;
}
} // namespace

TouchInputReceiverThread::TouchInputReceiverThread(QObject* parent)
    : ReceiveThread(BridgeEndpoint::Touch, parent)
{
    newest() = this;
}

TouchInputReceiverThread::~TouchInputReceiverThread() = default;

TouchInputReceiverThread* TouchInputReceiverThread::instance()
{
    return newest();
}

void TouchInputReceiverThread::setPassThroughViewVisible(bool visible)
{
    HMI2NAVMessageSender::instance()->send(wireName, QStringLiteral("setPassThroughViewVisible"), {visible});
}

void TouchInputReceiverThread::setMobileNavTouchParamsOffset(bool active, int x, int y)
{
    HMI2NAVMessageSender::instance()->send(wireName, QStringLiteral("setMobileNavTouchParamsOffset"), {active, x, y});
}

} // namespace AL2HMIBridge
