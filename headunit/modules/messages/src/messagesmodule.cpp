// SPDX-License-Identifier: MIT
#include "messagesmodule.h"

#include "../../moduledomains.h"
#include "../../modulekeys.h"
#include "hardkeys.h"
#include "intenttable.h"
#include "messagecenter.h"
#include "moduleintents.h"
#include "moduletranslation.h"
#include "vehiclenotices.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentRequest>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/RequestView>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiLayeredState>

#include <QQmlContext>
#include <QQmlEngine>
#include <QUrl>

using HmiCore::HmiIntentManager;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::RequestView;
using HmiGuiFramework::StatusBarController;
using HmiGuiFramework::ViewManager;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

namespace {

using Data = IntentTable::Data;

constexpr int longestName = 256;

void addMessage(MessageCenter* center, const Data& data)
{
    Message message;
    message.sender = data.value(0).toString().left(longestName);
    message.text = data.value(1).toString();
    message.number = data.value(2).toString().left(longestName);
    message.place = data.value(3).toString().left(longestName);
    center->add(message);
}

QString problemOfMessage(const Data& data)
{
    return data.value(1).toString().trimmed().isEmpty() ? MessageCenter::tr("There is nothing in this message")
                                                        : QString();
}

IntentTable* makeIntents(MessageCenter* center, QObject* parent)
{
    const RequestView show(QStringLiteral("MESSAGES.Main"), QVariant(), false, QVariant());
    return new IntentTable(
        {{HmiIntentManager::ShowMessageCenter, [show](const Data&) { show(); }, {}, {}},
         {ModuleIntent::AddMessage, [center](const Data& data) { addMessage(center, data); }, {}, problemOfMessage}},
        parent);
}

/// Who looks at the messages sees it there.
void announce()
{
    const auto* const views = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
    auto* const statusBar = DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"));
    if (views && statusBar && !views->currentView().startsWith(QLatin1String("MESSAGES.")))
        statusBar->requestTransientWidget(QStringLiteral("MESSAGES.Arrived"), 0);
}

} // namespace

MessagesModule::MessagesModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_center(new MessageCenter(this))
    , m_notices(new VehicleNotices(this))
    , m_intents(makeIntents(m_center, this))
{
    new HardKeys(
        {{ModuleKey::Messages, HmiCore::HmiIntentRequest(HmiIntentManager::ShowMessageCenter, false, QVariant())}},
        this);
    connect(m_notices, &VehicleNotices::noticed, m_center, &MessageCenter::add);
    connect(m_center, &MessageCenter::arrived, this, &announce);
    connect(m_center->model(), &MessageModel::unreadCountChanged, this, &MessagesModule::showMark);
}

/// A product may have no place for marks.
void MessagesModule::showMark() const
{
    auto* const manager = HmiIntentManager::instance();
    if (manager->canPerformAction(ModuleIntent::ShowModuleMark))
        manager->requestAction(ModuleIntent::ShowModuleMark, {moduleId(), m_center->model()->unreadCount()});
}

QString MessagesModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Messages"));
}

int MessagesModule::modulePriority() const
{
    return 27;
}

int MessagesModule::moduleDomain() const
{
    return ModuleDomain::Messages;
}

QString MessagesModule::viewDescriptorFile() const
{
    return QStringLiteral(":/messages/views.json");
}

HmiStateMachine::Identifier MessagesModule::rootStateIdentifier() const
{
    return QStringLiteral("MESSAGES");
}

QUrl MessagesModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/messages"));
}

void MessagesModule::registerTypes()
{
    qmlRegisterAnonymousType<MessageModel>("HmiMessages", 1);
}

NamedState* MessagesModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("MESSAGES.Main"), root));
    new HmiState(QStringLiteral("MESSAGES.Detail"), root);
    return root;
}

void MessagesModule::setupRootContext(QQmlContext* rootContext)
{
    registerModuleTranslation(QStringLiteral("messages"), this);
    HmiIntentManager::instance()->registerIntentHandler(m_intents);
    rootContext->setContextProperty(QStringLiteral("_messages"), m_center);
}
