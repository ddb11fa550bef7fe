// SPDX-License-Identifier: MIT
#include "requestpopup.h"

#include "datastore.h"
#include "guicategory.h"
#include "viewmanager.h"

namespace HmiGuiFramework {

RequestPopup::RequestPopup(HmiStateMachine::PopupState* state, const QVariant& data)
    : m_state(state)
    , m_data(data)
{
}

void RequestPopup::operator()() const
{
    auto* const manager = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
    if (!m_state)
        qCWarning(guiCategory, "popup requested whose state is gone");
    else if (!manager)
        qCWarning(guiCategory).noquote() << "popup" << m_state->name() << "requested, but there is no view manager";
    else
        manager->requestPopup(m_state->name(), m_data);
}

} // namespace HmiGuiFramework
