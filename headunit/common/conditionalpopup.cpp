// SPDX-License-Identifier: MIT
#include "conditionalpopup.h"

#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/StateMachine>

#include <utility>

using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;
using HmiStateMachine::StateMachine;

ConditionalPopup::ConditionalPopup(const QString& name, std::function<bool()> condition, QObject* parent)
    : QObject(parent)
    , m_name(name)
    , m_condition(std::move(condition))
{
    // The condition may hold before anything can be shown.
    connect(StateMachine::instance(), &QStateMachine::started, this, &ConditionalPopup::update);
}

void ConditionalPopup::update()
{
    auto* const views = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
    if (!views || !StateMachine::instance()->isRunning() || m_condition() == m_held)
        return;
    m_held = !m_held;
    if (m_held)
        views->requestPopup(m_name);
    else
        views->closePopup(m_name);
}

void ConditionalPopup::dismiss()
{
    if (auto* const views = DataStore::get<ViewManager>(QStringLiteral("ViewManager")))
        views->closePopup(m_name);
}
