// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QObject>
#include <QTimer>

namespace HmiVehicle {

class VehicleService;

/// Waits until the HMIs have handled all that was sent to them, and what they do a moment later because of it. One that does
/// not answer fences is given a quiet time instead.
class Fence : public QObject
{
    Q_OBJECT

public:
    Fence(VehicleService& service, int quietTime, QObject* parent);

Q_SIGNALS:
    /// Once. \a answered: all HMIs answered, so it is certain.
    void passed(bool answered);

private:
    void sendNext();
    void take(int number);

    VehicleService& m_service;
    QTimer m_quiet;
    int m_sent = 0;
    int m_number = 0;
    int m_missing = 0; ///< answers
};

} // namespace HmiVehicle
