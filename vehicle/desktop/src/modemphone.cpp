// SPDX-License-Identifier: MIT
#include "HmiVehicle/modemphone.h"

#include "HmiVehicle/vehicleservice.h"
#include "proxies.h"

#include <QDBusArgument>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>

#include <initializer_list>

namespace HmiVehicle {

namespace {

const auto serviceName = QStringLiteral("org.ofono");
const auto managerInterface = QStringLiteral("org.ofono.Manager");
const auto callsInterface = QStringLiteral("org.ofono.VoiceCallManager");
const auto callInterface = QStringLiteral("org.ofono.VoiceCall");

struct BusObject
{
    QString path;
    QVariantMap properties;
};

/// The modems or calls in an answer; none when it is of another shape.
QList<BusObject> objectsIn(const QDBusMessage& answer)
{
    QList<BusObject> objects;
    if (answer.type() != QDBusMessage::ReplyMessage || answer.signature() != QLatin1String("a(oa{sv})"))
        return objects;
    const auto list = answer.arguments().at(0).value<QDBusArgument>();
    list.beginArray();
    while (!list.atEnd()) {
        QDBusObjectPath path;
        QVariantMap properties;
        list.beginStructure();
        list >> path >> properties;
        list.endStructure();
        objects.append({path.path(), properties});
    }
    list.endArray();
    return objects;
}

CallShown::State stateFrom(const QString& text)
{
    if (text == QLatin1String("incoming") || text == QLatin1String("waiting"))
        return CallShown::Incoming;
    if (text == QLatin1String("dialing") || text == QLatin1String("alerting"))
        return CallShown::Dialling;
    if (text == QLatin1String("active") || text == QLatin1String("held"))
        return CallShown::Connected;
    return CallShown::None;
}

} // namespace

ModemPhone::ModemPhone(const QDBusConnection& bus, VehicleService& service, QObject* parent)
    : QObject(parent)
    , m_bus(bus)
    , m_service(service)
    , m_watcher(serviceName, bus, QDBusServiceWatcher::WatchForOwnerChange)
{
    connect(&m_watcher, &QDBusServiceWatcher::serviceOwnerChanged, this, [this] {
        leave();
        find();
    });
    find();
}

ModemPhone::~ModemPhone()
{
    leave();
}

void ModemPhone::find()
{
    QDBusMessage message =
        QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"), QStringLiteral("/org/freedesktop/DBus"),
                                       QStringLiteral("org.freedesktop.DBus"), QStringLiteral("GetNameOwner"));
    message << serviceName;
    auto* const owner = new QDBusPendingCallWatcher(m_bus.asyncCall(message), this);
    connect(owner, &QDBusPendingCallWatcher::finished, this, [this, owner] {
        owner->deleteLater();
        const QDBusPendingReply<QString> reply(*owner);
        if (!reply.isValid() || reply.value() == m_owner)
            return;
        leave();
        m_owner = reply.value();
        findModem();
    });
}

void ModemPhone::findModem()
{
    const QDBusMessage message =
        QDBusMessage::createMethodCall(m_owner, QStringLiteral("/"), managerInterface, QStringLiteral("GetModems"));
    auto* const modems = new QDBusPendingCallWatcher(m_bus.asyncCall(message), this);
    connect(modems, &QDBusPendingCallWatcher::finished, this, [this, modems, asked = m_owner] {
        modems->deleteLater();
        const QList<BusObject> found = objectsIn(modems->reply());
        if (asked != m_owner || found.isEmpty())
            return;
        watchModem(found.constFirst().path);
        if (found.constFirst().properties.value(QStringLiteral("Interfaces")).toStringList().contains(callsInterface))
            useModem();
    });
}

void ModemPhone::watchModem(const QString& path)
{
    m_modem = path;
    m_modemProxy = std::make_unique<OfonoProxy>(m_owner, path, "org.ofono.Modem", m_bus);
    connect(m_modemProxy.get(), &OfonoProxy::PropertyChanged, this,
            [this](const QString& name, const QDBusVariant& value) {
                if (name != QLatin1String("Interfaces"))
                    return;
                const bool canCall = value.variant().toStringList().contains(callsInterface);
                if (canCall && !m_manager)
                    useModem();
                else if (!canCall && m_manager) {
                    m_manager.release()->deleteLater();
                    removeCall(m_call);
                    m_service.vehicle().setPhoneRemote(nullptr);
                }
            });
}

void ModemPhone::useModem()
{
    m_manager = std::make_unique<CallManagerProxy>(m_owner, m_modem, m_bus);
    connect(m_manager.get(), &CallManagerProxy::CallAdded, this,
            [this](const QDBusObjectPath& path, const QVariantMap& properties) { addCall(path.path(), properties); });
    connect(m_manager.get(), &CallManagerProxy::CallRemoved, this,
            [this](const QDBusObjectPath& path) { removeCall(path.path()); });
    m_service.vehicle().setPhoneRemote(this);
    const QDBusMessage message =
        QDBusMessage::createMethodCall(m_owner, m_modem, callsInterface, QStringLiteral("GetCalls"));
    auto* const calls = new QDBusPendingCallWatcher(m_bus.asyncCall(message), this);
    connect(calls, &QDBusPendingCallWatcher::finished, this, [this, calls, asked = m_owner] {
        calls->deleteLater();
        const QList<BusObject> found = objectsIn(calls->reply());
        if (asked == m_owner && m_manager && !found.isEmpty())
            addCall(found.constFirst().path, found.constFirst().properties);
    });
}

void ModemPhone::leave()
{
    m_owner.clear();
    m_modem.clear();
    m_call.clear();
    for (QObject* const proxy : std::initializer_list<QObject*>{m_callProxy.release(), m_modemProxy.release()})
        if (proxy)
            proxy->deleteLater(); // it may be its signal that is handled
    if (!m_manager)
        return;
    m_manager.release()->deleteLater();
    m_service.vehicle().setPhoneRemote(nullptr);
}

void ModemPhone::addCall(const QString& path, const QVariantMap& properties)
{
    if (!m_call.isEmpty())
        return; // one at a time
    m_call = path;
    m_state.clear();
    m_number.clear();
    m_name.clear();
    m_callProxy = std::make_unique<OfonoProxy>(m_owner, path, "org.ofono.VoiceCall", m_bus);
    connect(m_callProxy.get(), &OfonoProxy::PropertyChanged, this,
            [this](const QString& name, const QDBusVariant& value) { takeProperty(name, value.variant()); });
    for (auto property = properties.constBegin(); property != properties.constEnd(); ++property)
        takeProperty(property.key(), property.value());
}

void ModemPhone::removeCall(const QString& path)
{
    if (path != m_call || m_call.isEmpty())
        return;
    m_call.clear();
    if (m_callProxy)
        m_callProxy.release()->deleteLater();
    m_service.vehicle().showCall(CallShown());
}

void ModemPhone::takeProperty(const QString& name, const QVariant& value)
{
    if (name == QLatin1String("State"))
        m_state = value.toString();
    else if (name == QLatin1String("LineIdentification"))
        m_number = value.toString();
    else if (name == QLatin1String("Name"))
        m_name = value.toString();
    m_service.vehicle().showCall({stateFrom(m_state), m_number, m_name});
}

void ModemPhone::send(const QString& path, const QString& interface, const QString& method,
                      const QVariantList& arguments)
{
    QDBusMessage message = QDBusMessage::createMethodCall(m_owner, path, interface, method);
    message.setArguments(arguments);
    m_bus.asyncCall(message);
}

void ModemPhone::dial(const QString& number)
{
    send(m_modem, callsInterface, QStringLiteral("Dial"), {number, QString()});
}

void ModemPhone::answer()
{
    if (!m_call.isEmpty())
        send(m_call, callInterface, QStringLiteral("Answer"));
}

void ModemPhone::hangUp()
{
    if (!m_call.isEmpty())
        send(m_call, callInterface, QStringLiteral("Hangup"));
}

} // namespace HmiVehicle
