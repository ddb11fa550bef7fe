// SPDX-License-Identifier: MIT
#include "turnannouncer.h"

#include "navigator.h"

#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/ViewManager>

#include <utility>

using HmiCore::HmiIntentManager;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::StatusBarController;
using HmiGuiFramework::ViewManager;

namespace {
constexpr double nearTurn = 250; ///< metres
}

TurnAnnouncer::TurnAnnouncer(Navigator* navigator, QObject* parent)
    : QObject(parent)
    , m_navigator(navigator)
{
    connect(navigator, &Navigator::guidanceChanged, this, &TurnAnnouncer::update);
    connect(navigator, &Navigator::routeChanged, this, [this] { m_announced = -1; });
}

void TurnAnnouncer::start()
{
    connect(DataStore::get<ViewManager>(QStringLiteral("ViewManager")), &ViewManager::currentViewChanged, this,
            &TurnAnnouncer::update);
}

void TurnAnnouncer::setEnabled(bool enabled)
{
    if (enabled == m_enabled)
        return;
    m_enabled = enabled;
    Q_EMIT enabledChanged();
    update();
}

void TurnAnnouncer::update()
{
    const auto* const views = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
    const bool isElsewhere = views && !views->currentView().startsWith(QLatin1String("NAVIGATION."));
    if (!m_enabled || !isElsewhere || !m_navigator->isActive()) {
        tell({});
        return;
    }
    tell({m_navigator->turnIcon(), m_navigator->turnDistance(), m_navigator->turnStreet()});
    announceNearTurn();
}

void TurnAnnouncer::tell(const QVariantList& hint)
{
    if (hint == std::exchange(m_told, hint))
        return;
    const int intent =
        hint.isEmpty() ? HmiIntentManager::NavTBTTransientHidden : HmiIntentManager::NavTBTTransientShown;
    if (HmiIntentManager::instance()->canPerformAction(intent)) // a product may have no place for hints
        HmiIntentManager::instance()->requestAction(intent, hint);
}

void TurnAnnouncer::announceNearTurn()
{
    if (!m_navigator->isDriving() || m_navigator->metresToTurn() > nearTurn || m_navigator->nextStep() == m_announced)
        return;
    m_announced = m_navigator->nextStep();
    DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"))
        ->requestTransientWidget(QStringLiteral("NAVIGATION.Turn"), 0);
}
