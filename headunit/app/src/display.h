// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

/// \brief Whether the screen is dark although the head unit is switched on. GUI thread only.
///
/// A call that comes in lights it, and so does switching the head unit on or off.
class Display : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool off READ isOff NOTIFY offChanged)

public:
    explicit Display(QObject* parent);

    bool isOff() const { return m_off; }
    void setOff(bool off);

Q_SIGNALS:
    void offChanged();

private:
    bool m_off = false;
};
