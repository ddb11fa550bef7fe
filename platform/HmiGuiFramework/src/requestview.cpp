// SPDX-License-Identifier: MIT
#include "requestview.h"

#include "datastore.h"
#include "guicategory.h"
#include "viewmanager.h"

namespace HmiGuiFramework {

RequestView::RequestView(const QString& name, const QVariant& data, bool reverse, const QVariant& transition)
    : m_name(name)
    , m_data(data)
    , m_reverse(reverse)
    , m_transition(transition)
{
}

void RequestView::operator()() const
{
    if (auto* const manager = DataStore::get<ViewManager>(QStringLiteral("ViewManager")))
        manager->requestView(m_name, m_data, m_reverse, m_transition);
    else
        qCWarning(guiCategory).noquote() << "view" << m_name << "requested, but there is no view manager";
}

} // namespace HmiGuiFramework
