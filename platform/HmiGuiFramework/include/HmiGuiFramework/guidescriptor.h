// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QHash>
#include <QString>
#include <QUrl>
#include <QVariant>

namespace HmiGuiFramework {

/// \brief One view of the HMI: a QML item that is shown while the state of the same name is active.
struct HMIGUIFRAMEWORK_EXPORT ViewDescriptor
{
    QString identifier;              ///< prefix, dot, name in the descriptor; the name of its state
    QUrl url;                        ///< of the QML file, for the variation in force
    QString transition;              ///< of TransitionManager, empty for the default one
    bool keepAlive = false;          ///< never dropped from the view cache
    int domain = 0;                  ///< third argument of ViewManager::loadModule()
    QHash<QString, QUrl> variations; ///< QML file by name of the variation; the empty name is the base file
};

/// \brief One popup of the HMI: a QML item shown over the views while it is requested and topmost.
struct HMIGUIFRAMEWORK_EXPORT PopupDescriptor
{
    QString identifier;              ///< prefix, dot, name in the descriptor; the name of its state
    QUrl url;                        ///< of the QML file, for the variation in force
    int priority = 0;                ///< 0 to 100; the largest is topmost, among equals the newest
    int timeout = 0;                 ///< milliseconds on top until it closes by itself; 0 never
    QHash<QString, QUrl> variations; ///< as for views
};

/// \brief All views and popups that are loaded. A plain value.
struct HMIGUIFRAMEWORK_EXPORT GuiDescriptor
{
    QHash<QString, ViewDescriptor> views;   ///< by identifier
    QHash<QString, PopupDescriptor> popups; ///< by identifier
};

} // namespace HmiGuiFramework
