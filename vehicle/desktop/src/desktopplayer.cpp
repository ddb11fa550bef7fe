// SPDX-License-Identifier: MIT
#include "HmiVehicle/desktopplayer.h"

#include "HmiVehicle/vehicleservice.h"
#include "proxies.h"

#include <QDBusArgument>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>

namespace HmiVehicle {

namespace {

constexpr int positionInterval = 1000; ///< milliseconds; players do not tell their position by themselves
constexpr double microseconds = 1e6;
constexpr int longestTime = 1000000; ///< seconds

const auto playerPrefix = QStringLiteral("org.mpris.MediaPlayer2.");
const auto playerPath = QStringLiteral("/org/mpris/MediaPlayer2");
const auto playerInterface = QStringLiteral("org.mpris.MediaPlayer2.Player");
const auto propertiesInterface = QStringLiteral("org.freedesktop.DBus.Properties");

int seconds(const QVariant& value)
{
    return int(qBound(0.0, value.toDouble() / microseconds, double(longestTime)));
}

QVariantMap mapFrom(const QVariant& value)
{
    if (value.userType() != qMetaTypeId<QDBusArgument>())
        return value.toMap();
    const auto argument = value.value<QDBusArgument>();
    return argument.currentType() == QDBusArgument::MapType && argument.currentSignature() == QLatin1String("a{sv}")
               ? qdbus_cast<QVariantMap>(argument)
               : QVariantMap();
}

QDBusMessage busCall(const QString& method)
{
    return QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"),
                                          QStringLiteral("/org/freedesktop/DBus"),
                                          QStringLiteral("org.freedesktop.DBus"), method);
}

} // namespace

DesktopPlayer::DesktopPlayer(const QDBusConnection& bus, VehicleService& service, QObject* parent)
    : QObject(parent)
    , m_bus(bus)
    , m_service(service)
{
    m_watcher.setConnection(bus);
    m_watcher.setWatchMode(QDBusServiceWatcher::WatchForOwnerChange);
    m_watcher.addWatchedService(QStringLiteral("org.mpris.MediaPlayer2*"));
    connect(&m_watcher, &QDBusServiceWatcher::serviceOwnerChanged, this,
            [this](const QString& name, const QString&, const QString& owner) {
                if (name == m_name)
                    detach();
                if (m_name.isEmpty() && !owner.isEmpty() && name.startsWith(playerPrefix))
                    attach(name, owner);
                else if (m_name.isEmpty())
                    findPlayers();
            });
    m_positionTimer.setInterval(positionInterval);
    connect(&m_positionTimer, &QTimer::timeout, this, &DesktopPlayer::askForPosition);
    findPlayers();
}

DesktopPlayer::~DesktopPlayer()
{
    detach();
}

void DesktopPlayer::findPlayers()
{
    auto* const names = new QDBusPendingCallWatcher(m_bus.asyncCall(busCall(QStringLiteral("ListNames"))), this);
    connect(names, &QDBusPendingCallWatcher::finished, this, [this, names] {
        names->deleteLater();
        const QStringList found = QDBusPendingReply<QStringList>(*names).value().filter(playerPrefix);
        if (found.isEmpty() || !m_name.isEmpty())
            return;
        QDBusMessage message = busCall(QStringLiteral("GetNameOwner"));
        message << found.constFirst();
        auto* const owner = new QDBusPendingCallWatcher(m_bus.asyncCall(message), this);
        connect(owner, &QDBusPendingCallWatcher::finished, this, [this, owner, name = found.constFirst()] {
            owner->deleteLater();
            const QDBusPendingReply<QString> reply(*owner);
            if (reply.isValid() && m_name.isEmpty())
                attach(name, reply.value());
        });
    });
}

void DesktopPlayer::attach(const QString& name, const QString& owner)
{
    m_name = name;
    m_owner = owner;
    m_shown = MediaShown();
    m_track.clear();
    m_properties = std::make_unique<PropertiesProxy>(owner, playerPath, m_bus);
    connect(m_properties.get(), &PropertiesProxy::PropertiesChanged, this,
            [this](const QString& interface, const QVariantMap& changed, const QStringList& invalidated) {
                if (interface != playerInterface)
                    return;
                take(changed);
                if (!invalidated.isEmpty())
                    askForAll();
            });
    m_service.vehicle().setMediaRemote(this);
    askForAll();
    m_positionTimer.start();
}

void DesktopPlayer::detach()
{
    if (m_name.isEmpty())
        return;
    m_positionTimer.stop();
    m_name.clear();
    m_owner.clear();
    if (m_properties)
        m_properties.release()->deleteLater(); // it may be its signal that is handled
    m_service.vehicle().setMediaRemote(nullptr);
}

void DesktopPlayer::askForAll()
{
    QDBusMessage message =
        QDBusMessage::createMethodCall(m_owner, playerPath, propertiesInterface, QStringLiteral("GetAll"));
    message << playerInterface;
    auto* const all = new QDBusPendingCallWatcher(m_bus.asyncCall(message), this);
    connect(all, &QDBusPendingCallWatcher::finished, this, [this, all, owner = m_owner] {
        all->deleteLater();
        const QDBusPendingReply<QVariantMap> reply(*all);
        if (reply.isValid() && owner == m_owner)
            take(reply.value());
    });
}

void DesktopPlayer::askForPosition()
{
    if (!m_shown.playing)
        return;
    QDBusMessage message =
        QDBusMessage::createMethodCall(m_owner, playerPath, propertiesInterface, QStringLiteral("Get"));
    message << playerInterface << QStringLiteral("Position");
    auto* const position = new QDBusPendingCallWatcher(m_bus.asyncCall(message), this);
    connect(position, &QDBusPendingCallWatcher::finished, this, [this, position, owner = m_owner] {
        position->deleteLater();
        const QDBusPendingReply<QDBusVariant> reply(*position);
        if (reply.isValid() && owner == m_owner)
            take({{QStringLiteral("Position"), reply.value().variant()}});
    });
}

void DesktopPlayer::take(const QVariantMap& properties)
{
    if (properties.contains(QStringLiteral("PlaybackStatus")))
        m_shown.playing = properties.value(QStringLiteral("PlaybackStatus")).toString() == QLatin1String("Playing");
    if (properties.contains(QStringLiteral("Position")))
        m_shown.position = seconds(properties.value(QStringLiteral("Position")));
    if (properties.contains(QStringLiteral("Metadata"))) {
        const QVariantMap data = mapFrom(properties.value(QStringLiteral("Metadata")));
        const QString track = data.value(QStringLiteral("mpris:trackid")).value<QDBusObjectPath>().path();
        if (track != m_track && !properties.contains(QStringLiteral("Position")))
            m_shown.position = 0;
        m_track = track;
        m_shown.title = data.value(QStringLiteral("xesam:title")).toString();
        m_shown.artist = data.value(QStringLiteral("xesam:artist")).toStringList().join(QStringLiteral(", "));
        m_shown.album = data.value(QStringLiteral("xesam:album")).toString();
        m_shown.duration = seconds(data.value(QStringLiteral("mpris:length")));
    }
    m_service.vehicle().showMedia(m_shown);
}

void DesktopPlayer::call(const QString& method, const QVariantList& arguments)
{
    QDBusMessage message = QDBusMessage::createMethodCall(m_owner, playerPath, playerInterface, method);
    message.setArguments(arguments);
    m_bus.asyncCall(message);
}

void DesktopPlayer::setPlaying(bool playing)
{
    call(playing ? QStringLiteral("Play") : QStringLiteral("Pause"));
}

void DesktopPlayer::next()
{
    call(QStringLiteral("Next"));
}

void DesktopPlayer::previous()
{
    call(QStringLiteral("Previous"));
}

void DesktopPlayer::seekTo(int position)
{
    if (m_track.isEmpty())
        return;
    call(QStringLiteral("SetPosition"),
         {QVariant::fromValue(QDBusObjectPath(m_track)), qlonglong(position) * qlonglong(microseconds)});
    m_shown.position = position;
    m_service.vehicle().showMedia(m_shown);
}

} // namespace HmiVehicle
