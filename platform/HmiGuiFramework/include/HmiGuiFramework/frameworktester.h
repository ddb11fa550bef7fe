// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QList>
#include <QString>

namespace HmiGuiFramework {

/// \brief Requests of a test harness, by name, to the view manager in the DataStore. GUI thread only.
///
/// Without a view manager each call gives one warning; refused requests are logged by the view manager.
class HMIGUIFRAMEWORK_EXPORT FrameworkTester
{
public:
    static void hmiViewRequest(const QString& name);               ///< as ViewManager::requestView()
    static void hmiViewBatchRequest(const QList<QString>& names);  ///< each as soon as the one before is shown
    static void hmiPopupRequest(const QString& name);              ///< as ViewManager::requestPopup()
    static void hmiPopupBatchRequest(const QList<QString>& names); ///< all at once; priorities decide what is on top
};

} // namespace HmiGuiFramework
