// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/remotes.h"

#include <QDBusConnection>
#include <QDBusServiceWatcher>
#include <QObject>
#include <QTimer>
#include <QVariantMap>

#include <memory>

class QDBusPendingCall;

namespace HmiVehicle {

class PropertiesProxy;
class VehicleService;

/// \brief Lets a player of the desktop (MPRIS2) be the vehicle's media player while there is one on the bus.
///
/// The player that is found first is used until it leaves. All calls are asynchronous. Needs the event loop of the service's
/// thread.
class DesktopPlayer : public QObject, private MediaRemote
{
    Q_OBJECT

public:
    /// \brief \a service must outlive this, so it is no parent for it.
    DesktopPlayer(const QDBusConnection& bus, VehicleService& service, QObject* parent = nullptr);
    ~DesktopPlayer() override;

    /// \brief The name of the player on the bus, empty without one.
    QString player() const { return m_name; }

private:
    void setPlaying(bool playing) override;
    void next() override;
    void previous() override;
    void seekTo(int position) override;

    void findPlayers();
    void attach(const QString& name, const QString& owner);
    void detach();
    void call(const QString& method, const QVariantList& arguments = {});
    void take(const QVariantMap& properties);
    void askForAll();
    void askForPosition();

    QDBusConnection m_bus;
    VehicleService& m_service;
    QDBusServiceWatcher m_watcher;
    std::unique_ptr<PropertiesProxy> m_properties;
    QTimer m_positionTimer;
    QString m_name;
    QString m_owner;
    QString m_track;
    MediaShown m_shown;
};

} // namespace HmiVehicle
