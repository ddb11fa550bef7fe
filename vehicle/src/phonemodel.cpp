// SPDX-License-Identifier: MIT
#include "phonemodel.h"

namespace HmiVehicle {

namespace {

constexpr int ringingTime = 30000;
constexpr int answerTime = 4000;

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

    on("toggleSiriActivation", [this](const QJsonArray& arguments) { set("siriActive", arguments.at(0).toBool()); });
    on("togglePhoneVoiceServiceActivation",
       [this](const QJsonArray& arguments) { set("phoneVoiceServiceActive", arguments.at(0).toBool()); });
    on("dial", [this](const QJsonArray& arguments) { dial(arguments.at(0).toString()); });
    on("acceptCall", [this] {
        if (value("incomingCall").toBool())
            connectCall();
    });
    on("rejectCall", [this] {
        if (value("incomingCall").toBool())
            endCall();
    });
    on("hangUp", [this] { hangUp(); });
    on("setPrivateMode", [this](const QJsonArray& arguments) {
        if (value("callConnected").toBool())
            set("privateMode", arguments.at(0).toBool());
    });
}

bool PhoneModel::busy() const
{
    return value("incomingCall").toBool() || value("callConnected").toBool() || value("dialling").toBool();
}

void PhoneModel::ring(const QString& number)
{
    if (busy())
        return;
    showOtherEnd(number);
    set("incomingCall", true);
    m_task = scheduler().every(ringingTime, [this] { endCall(); });
}

void PhoneModel::dial(const QString& number)
{
    if (busy() || number.trimmed().isEmpty())
        return;
    showOtherEnd(number.trimmed().left(64));
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
    if (busy())
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
