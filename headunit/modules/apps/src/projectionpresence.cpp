// SPDX-License-Identifier: MIT
#include "projectionpresence.h"

#include "units.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/ProjectionSource>
#include <HmiCore/HmiMarketPropertyStore>

using AL2HMIBridge::GlobalSource;
using AL2HMIBridge::ProjectionSource;

ProjectionPresence::ProjectionPresence(QObject* parent)
    : QObject(parent)
{
    connect(ProjectionSource::instance(), &ProjectionSource::projectionModeChanged, this, &ProjectionPresence::changed);
    connect(ProjectionSource::instance(), &ProjectionSource::projectedDeviceNameChanged, this,
            &ProjectionPresence::changed);
    connect(GlobalSource::instance(), &GlobalSource::destinationCountryChanged, this, &ProjectionPresence::changed);
}

/// The bridge numbers the kinds from 1; one that it does not know yet needs no cable.
ProjectionPresence::Kind ProjectionPresence::kind() const
{
    switch (ProjectionSource::instance()->projectionMode()) {
    case 0:
        return None;
    case 1:
        return Cable;
    default:
        return Air;
    }
}

QString ProjectionPresence::phoneName() const
{
    return isConnected() ? ProjectionSource::instance()->projectedDeviceName() : QString();
}

bool ProjectionPresence::isOffered() const
{
    const QVariant offered = HmiCore::HmiRegionPropertyStore::instance()->getProperty(
        Units::marketProperty("region").toInt(), QStringLiteral("projection"));
    return offered.userType() != QMetaType::Bool || offered.toBool(); // what is missing is a text
}
