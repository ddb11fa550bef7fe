// SPDX-License-Identifier: MIT
#include "source.h"

#include "hmi2almessagesender.h"

#include <QCoreApplication>
#include <QJsonArray>

namespace AL2HMIBridge {

Source::Source(const char* name)
    : QObject(QCoreApplication::instance())
    , m_name(name)
{
}

Source::~Source() = default;

void Source::send(const char* call) const
{
    send(call, QJsonArray());
}

void Source::send(const char* call, const QJsonArray& arguments) const
{
    HMI2ALMessageSender::instance()->send(QLatin1String(m_name), QLatin1String(call), arguments);
}

} // namespace AL2HMIBridge
