// SPDX-License-Identifier: MIT
#include "phonesettings.h"

#include <HmiCore/HmiManager>
#include <HmiGuiFramework/HmiAction>
#include <HmiGuiFramework/RequestView>
#include <HmiStateMachine/HmiState>

using HmiCore::HmiManager;
using HmiGuiFramework::HmiAction;
using HmiGuiFramework::RequestView;

namespace {
const QString mainView = QStringLiteral("SETTINGS.Phone.Main");
}

PhoneSettings::PhoneSettings(QObject* parent)
    : HmiHostedSubmodule(parent)
    , m_entryAction(new HmiAction(this))
{
    const auto translate = [this] { m_entryAction->setText(tr("Phone")); };
    translate();
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, translate);
    m_entryAction->setIcon(QStringLiteral("phone"));
    m_entryAction->setOrder(30);
    connect(m_entryAction, &HmiAction::triggered, this, RequestView(mainView, QVariant(), false, QVariant()));
}

HmiAction* PhoneSettings::entryAction()
{
    return m_entryAction;
}

QString PhoneSettings::moduleId() const
{
    return QStringLiteral("SETTINGS.Phone");
}

QString PhoneSettings::submoduleName() const
{
    return QStringLiteral("Phone settings");
}

QString PhoneSettings::viewDescriptorFile() const
{
    return QStringLiteral(":/phone/settingsviews.json");
}

void PhoneSettings::create(HmiStateMachine::HmiState* hostState)
{
    new HmiStateMachine::HmiState(mainView, hostState);
}
