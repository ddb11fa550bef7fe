// SPDX-License-Identifier: MIT
#pragma once

#include "guidescriptor.h"
#include "transientcollection.h"

#include <QPair>
#include <QStringList>
#include <QVector>

namespace HmiGuiFramework {

/// What a descriptor file offers, with identifiers that carry the prefix. Faulty entries are left out.
struct ParsedDescriptor
{
    QUrl shell;
    QVector<ViewDescriptor> views;
    QVector<PopupDescriptor> popups;
    QVector<TransientDescriptor> transients;
    QVector<QPair<QString, ComponentDescriptor>> components;
    QStringList errors; ///< each names its field, such as "views[2].url: …"
};

/// Reads the descriptor at \a path, a file or resource. URLs in it are relative to its folder.
ParsedDescriptor parseDescriptor(const QString& path, const QString& prefix, int domain);

} // namespace HmiGuiFramework
