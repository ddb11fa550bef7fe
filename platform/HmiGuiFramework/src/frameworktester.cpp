// SPDX-License-Identifier: MIT
#include "frameworktester.h"

#include "datastore.h"
#include "guicategory.h"
#include "viewmanager.h"

namespace HmiGuiFramework {

namespace {
ViewManager* viewManagerFor(const char* request)
{
    auto* const manager = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
    if (!manager)
        qCWarning(guiCategory, "%s: there is no view manager", request);
    return manager;
}
} // namespace

void FrameworkTester::hmiViewRequest(const QString& name)
{
    if (auto* const manager = viewManagerFor("hmiViewRequest"))
        manager->requestView(name);
}

void FrameworkTester::hmiViewBatchRequest(const QList<QString>& names)
{
    if (auto* const manager = viewManagerFor("hmiViewBatchRequest"))
        manager->requestViews(names);
}

void FrameworkTester::hmiPopupRequest(const QString& name)
{
    if (auto* const manager = viewManagerFor("hmiPopupRequest"))
        manager->requestPopup(name);
}

void FrameworkTester::hmiPopupBatchRequest(const QList<QString>& names)
{
    auto* const manager = viewManagerFor("hmiPopupBatchRequest");
    if (!manager)
        return;
    for (const QString& name : names)
        manager->requestPopup(name);
}

} // namespace HmiGuiFramework
