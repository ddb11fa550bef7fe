// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QHash>
#include <QString>
#include <QUrl>

namespace HmiGuiFramework {

/// \brief A short notice in the status bar, such as the volume.
struct HMIGUIFRAMEWORK_EXPORT TransientDescriptor
{
    QString identifier;   ///< prefix, dot, own name
    QString componentKey; ///< of the component that draws it
    int timeout = 0;      ///< milliseconds that it stays
};

/// \brief A QML file that draws transients.
struct HMIGUIFRAMEWORK_EXPORT ComponentDescriptor
{
    QUrl url; ///< of the QML file
};

/// \brief All transients that are loaded. A plain value.
struct HMIGUIFRAMEWORK_EXPORT TransientCollection
{
    QHash<QString, TransientDescriptor> transients; ///< by identifier
    QHash<QString, ComponentDescriptor> components; ///< by component key
};

} // namespace HmiGuiFramework
