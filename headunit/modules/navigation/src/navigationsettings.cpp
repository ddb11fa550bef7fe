// SPDX-License-Identifier: MIT
#include "navigationsettings.h"

#include <HmiCore/HmiManager>
#include <HmiGuiFramework/HmiAction>
#include <HmiGuiFramework/RequestView>
#include <HmiStateMachine/HmiState>

using HmiCore::HmiManager;
using HmiGuiFramework::HmiAction;
using HmiGuiFramework::RequestView;

namespace {
const QString mainView = QStringLiteral("SETTINGS.Navigation.Main");
}

NavigationSettings::NavigationSettings(QObject* parent)
    : HmiHostedSubmodule(parent)
    , m_entryAction(new HmiAction(this))
{
    const auto translate = [this] { m_entryAction->setText(tr("Navigation")); };
    translate();
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, translate);
    m_entryAction->setIcon(QStringLiteral("navigation"));
    m_entryAction->setOrder(55);
    connect(m_entryAction, &HmiAction::triggered, this, RequestView(mainView, QVariant(), false, QVariant()));
}

HmiAction* NavigationSettings::entryAction()
{
    return m_entryAction;
}

QString NavigationSettings::moduleId() const
{
    return QStringLiteral("SETTINGS.Navigation");
}

QString NavigationSettings::submoduleName() const
{
    return QStringLiteral("Navigation settings");
}

QString NavigationSettings::viewDescriptorFile() const
{
    return QStringLiteral(":/navigation/settingsviews.json");
}

void NavigationSettings::create(HmiStateMachine::HmiState* hostState)
{
    new HmiStateMachine::HmiState(mainView, hostState);
}
