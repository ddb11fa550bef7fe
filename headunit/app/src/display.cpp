// SPDX-License-Identifier: MIT
#include "display.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/PhoneSource>

using AL2HMIBridge::GlobalSource;
using AL2HMIBridge::PhoneSource;

Display::Display(QObject* parent)
    : QObject(parent)
{
    connect(GlobalSource::instance(), &GlobalSource::powerOnChanged, this, [this] { setOff(false); });
    connect(PhoneSource::instance(), &PhoneSource::incomingCallChanged, this, [this] {
        if (PhoneSource::instance()->incomingCall())
            setOff(false);
    });
}

void Display::setOff(bool off)
{
    if (off == m_off)
        return;
    m_off = off;
    Q_EMIT offChanged();
}
