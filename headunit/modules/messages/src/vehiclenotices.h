// SPDX-License-Identifier: MIT
#pragma once

#include "message.h"

#include <QObject>

/// \brief What the vehicle and the phone have to tell by themselves: calls that nobody took, cold, an empty phone. GUI thread only.
class VehicleNotices : public QObject
{
    Q_OBJECT

public:
    explicit VehicleNotices(QObject* parent);

Q_SIGNALS:
    void noticed(const Message& message);

private:
    void watchCalls();
    void watchCold();
    void watchBattery();

    bool m_rings = false;
    QString m_caller; ///< of the call that rings or rang last
    QString m_number;
    bool m_isCold = false;
    bool m_isBatteryLow = false;
};
