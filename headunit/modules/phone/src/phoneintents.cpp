// SPDX-License-Identifier: MIT
#include "phoneintents.h"

#include "intenttable.h"
#include "phonecontroller.h"

#include <AL2HMIBridge/EAPhoneSource>
#include <AL2HMIBridge/PhoneSource>
#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/RequestView>
#include <HmiGuiFramework/ViewManager>

using AL2HMIBridge::EAPhoneSource;
using AL2HMIBridge::PhoneSource;
using HmiCore::HmiIntentManager;
using HmiGuiFramework::RequestView;

namespace {

using Data = IntentTable::Data;

constexpr int longestNumber = 64;

void show(const char* view)
{
    RequestView(QString::fromLatin1(view), QVariant(), false, QVariant())();
}

QString whyNoCall()
{
    const PhoneSource* const phone = PhoneSource::instance();
    if (EAPhoneSource::instance()->eventsBlocked())
        return PhoneController::tr("An emergency call is running");
    if (phone->deviceName().isEmpty())
        return PhoneController::tr("No phone is connected");
    if (phone->incomingCall() || phone->callConnected() || phone->dialling())
        return PhoneController::tr("A call is running");
    return QString();
}

/// Without a number to call, the driver is asked for one.
void makeCall(const Data& data)
{
    const QString number = data.value(0).toString().trimmed();
    if (number.isEmpty())
        show("PHONE.Keypad");
    else
        PhoneSource::instance()->dial(number);
}

QString problemOfNumber(const Data& data)
{
    return data.value(0).toString().size() > longestNumber ? PhoneController::tr("This is no telephone number")
                                                           : QString();
}

QString whyNoHint()
{
    return PhoneSource::instance()->siriEnabled() ? PhoneController::tr("The assistant is switched on") : QString();
}

void showHint(const Data&)
{
    HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"))
        ->requestPopup(PhoneController::assistantHintPopup());
}

} // namespace

IntentTable* makePhoneIntents(QObject* parent)
{
    auto* const intents = new IntentTable(
        {
            {HmiIntentManager::ShowPhone, [](const Data&) { show("PHONE.Main"); }, {}, {}},
            {HmiIntentManager::MakePhoneCall, makeCall, whyNoCall, problemOfNumber},
            {HmiIntentManager::PhoneSettings, [](const Data&) { show("SETTINGS.Phone.Main"); }, {}, {}},
            {HmiIntentManager::PhoneSiriNotEnabled, showHint, whyNoHint, {}},
        },
        parent);
    intents->watch(PhoneSource::instance(), &PhoneSource::deviceNameChanged, &PhoneSource::incomingCallChanged,
                   &PhoneSource::callConnectedChanged, &PhoneSource::diallingChanged, &PhoneSource::siriEnabledChanged);
    intents->watch(EAPhoneSource::instance(), &EAPhoneSource::eventsBlockedChanged);
    return intents;
}
