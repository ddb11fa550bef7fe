// SPDX-License-Identifier: MIT
#include "phonemodel.h"

namespace HmiVehicle {

namespace {

constexpr int ringingTime = 30000;
constexpr int answerTime = 4000;
constexpr int listeningTime = 8000;
constexpr int longestNumber = 64;
constexpr int longestName = 256;
constexpr int longestCall = 1000000; ///< seconds

struct Contact
{
    const char* name;
    const char* number;
};

// Invented people; the numbers are of ranges that nobody can have.
const Contact contacts[] = {
    {"Amélie Fontaine", "+33 1 99 00 12 34"}, {"Ben Okafor", "+44 20 7946 0018"},
    {"Carla Moretti", "+39 055 000 0142"},    {"Dana Whitfield", "+1 555 0100"},
    {"Garage Lindenau", "+49 30 23125 011"},  {"Home", "+1 555 0101"},
    {"Jürgen Weiß", "+49 30 23125 042"},      {"Office", "+1 555 0123"},
    {"Sofía Herrera", "+34 900 000 155"},     {"Tomáš Dvořák", "+420 000 000 167"},
    {"Yuki Tanaka", "+81 3 0000 0188"},       {"王芳", "+86 10 0000 0199"},
};

} // namespace

PhoneModel::PhoneModel(Scheduler& scheduler)
    : Model("PhoneSource", scheduler)
{
    for (const char* const field :
         {"incomingCall", "callConnected", "privateMode", "siriActive", "phoneVoiceServiceActive", "dialling"})
        set(field, false);
    set("siriSupported", true);
    set("siriEnabled", true);
    set("deviceName", QStringLiteral("Dana's phone"));
    set("signalStrength", 4);
    set("batteryLevel", 78);
    QJsonArray list;
    for (const Contact& contact : contacts)
        list.append(QJsonObject{{QStringLiteral("name"), QString::fromUtf8(contact.name)},
                                {QStringLiteral("number"), QString::fromUtf8(contact.number)}});
    set("contacts", list);
    endCall();

    on("toggleSiriActivation", [this](const QJsonArray& arguments) {
        const bool possible = value("siriSupported").toBool() && value("siriEnabled").toBool();
        listen("siriActive", &m_assistant, possible && arguments.at(0).toBool());
    });
    on("togglePhoneVoiceServiceActivation", [this](const QJsonArray& arguments) {
        listen("phoneVoiceServiceActive", &m_voiceService, arguments.at(0).toBool());
    });
    on("dial", [this](const QJsonArray& arguments) { dial(arguments.at(0).toString()); });
    on("acceptCall", [this] { accept(); });
    on("rejectCall", [this] { reject(); });
    on("hangUp", [this] { hangUp(); });
    on("setPrivateMode", [this](const QJsonArray& arguments) {
        if (value("callConnected").toBool())
            set("privateMode", arguments.at(0).toBool());
    });
}

void PhoneModel::accept()
{
    if (!value("incomingCall").toBool())
        return;
    if (m_remote)
        m_remote->answer();
    else
        connectCall();
}

void PhoneModel::reject()
{
    if (!value("incomingCall").toBool())
        return;
    if (m_remote)
        m_remote->hangUp();
    else
        endCall();
}

void PhoneModel::setRemote(PhoneRemote* remote)
{
    endCall();
    m_remote = remote;
}

void PhoneModel::show(const CallShown& shown)
{
    if (!m_remote)
        return;
    const bool wasConnected = value("callConnected").toBool();
    if (shown.state == CallShown::None)
        return endCall();
    if (shown.number.left(longestNumber) != value("callerNumber").toString() || !busy())
        showOtherEnd(shown.number.left(longestNumber));
    if (!shown.name.isEmpty())
        set("callerName", shown.name.left(longestName));
    set("incomingCall", shown.state == CallShown::Incoming);
    set("dialling", shown.state == CallShown::Dialling);
    if (shown.state == CallShown::Connected && !wasConnected)
        connectCall();
}

void PhoneModel::listen(const char* flag, int* timer, bool active)
{
    scheduler().cancel(timer);
    set(flag, active);
    if (active)
        *timer = scheduler().every(listeningTime, [this, flag, timer] { listen(flag, timer, false); });
}

bool PhoneModel::startVoiceService()
{
    if (value("deviceName").toString().isEmpty())
        return false;
    listen("phoneVoiceServiceActive", &m_voiceService, true);
    return true;
}

void PhoneModel::setConnected(bool connected)
{
    if (!connected) {
        endCall();
        listen("siriActive", &m_assistant, false);
        listen("phoneVoiceServiceActive", &m_voiceService, false);
    }
    set("deviceName", connected ? QStringLiteral("Dana's phone") : QString());
    set("siriSupported", connected);
    set("siriEnabled", connected);
    set("signalStrength", connected ? 4 : 0);
    set("batteryLevel", connected ? 78 : 0);
}

void PhoneModel::answerFarEnd()
{
    if (value("dialling").toBool())
        connectCall();
}

void PhoneModel::call(const QString& nameOrNumber)
{
    QString number = nameOrNumber;
    for (const Contact& contact : contacts)
        if (QString::fromUtf8(contact.name).compare(nameOrNumber, Qt::CaseInsensitive) == 0)
            number = QString::fromUtf8(contact.number);
    dial(number);
}

bool PhoneModel::assign(const QString& field, const QJsonValue& wanted)
{
    if (field == QLatin1String("incomingCall") && wanted.toBool() && !busy())
        ring(QString::fromUtf8(contacts[3].number));
    else if (field == QLatin1String("callConnected") && wanted.toBool() && !value("callConnected").toBool())
        connectCall();
    else if ((field == QLatin1String("incomingCall") || field == QLatin1String("callConnected")
              || field == QLatin1String("dialling"))
             && !wanted.toBool() && value(field.toLatin1().constData()).toBool())
        endCall();
    else
        return (field != QLatin1String("callDuration") || wanted.toInt() <= longestCall)
               && Model::assign(field, wanted);
    return true;
}

bool PhoneModel::busy() const
{
    return value("incomingCall").toBool() || value("callConnected").toBool() || value("dialling").toBool();
}

void PhoneModel::ring(const QString& number)
{
    if (busy() || value("deviceName").toString().isEmpty())
        return;
    showOtherEnd(number.left(longestNumber));
    set("incomingCall", true);
    m_task = scheduler().every(ringingTime, [this] { endCall(); });
}

void PhoneModel::dial(const QString& number)
{
    if (busy() || number.trimmed().isEmpty() || value("deviceName").toString().isEmpty())
        return;
    if (m_remote)
        return m_remote->dial(number.trimmed().left(longestNumber));
    showOtherEnd(number.trimmed().left(longestNumber));
    set("dialling", true);
    m_task = scheduler().answerAfter(answerTime, [this] { connectCall(); });
}

void PhoneModel::connectCall()
{
    scheduler().cancel(&m_task);
    set("incomingCall", false);
    set("dialling", false);
    set("callConnected", true);
    m_task = scheduler().every(1000, [this] { set("callDuration", value("callDuration").toInt() + 1); });
}

void PhoneModel::hangUp()
{
    if (busy() && m_remote)
        m_remote->hangUp();
    else if (busy())
        endCall();
}

void PhoneModel::endCall()
{
    scheduler().cancel(&m_task);
    for (const char* const field : {"incomingCall", "callConnected", "privateMode", "dialling"})
        set(field, false);
    showOtherEnd(QString());
}

void PhoneModel::showOtherEnd(const QString& number)
{
    QString name;
    for (const Contact& contact : contacts)
        if (QString::fromUtf8(contact.number) == number)
            name = QString::fromUtf8(contact.name);
    set("callerName", name);
    set("callerNumber", number);
    set("callDuration", 0);
}

} // namespace HmiVehicle
