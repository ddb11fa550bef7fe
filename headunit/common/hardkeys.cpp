// SPDX-License-Identifier: MIT
#include "hardkeys.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/ValetModeSource>

using namespace AL2HMIBridge;

HardKeys::HardKeys(const QVector<Entry>& entries, QObject* parent)
    : QObject(parent)
    , m_entries(entries)
{
    connect(KeySource::instance(), &KeySource::keyEvent, this, &HardKeys::handle);
}

void HardKeys::handle(int key, int state) const
{
    const bool acts = state == KeySource::KeyPressed || state == KeySource::KeyStepped;
    if (!acts || !GlobalSource::instance()->powerOn() || ValetModeSource::instance()->valetModeEnabled())
        return;
    for (const Entry& entry : m_entries)
        if (entry.key == key)
            entry.act();
}
