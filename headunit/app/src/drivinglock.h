// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

/// \brief Whether the driver has to look at the road: then nothing is typed or written, and long lists end early. GUI thread only.
///
/// It locks at 5 km/h and unlocks below 3, so that a queue does not let it flicker.
class DrivingLock : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool locked READ isLocked NOTIFY lockedChanged)

public:
    explicit DrivingLock(QObject* parent);

    bool isLocked() const { return m_locked; }

Q_SIGNALS:
    void lockedChanged();

private:
    void update();

    bool m_locked = false;
};
