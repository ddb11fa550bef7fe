// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/remotes.h"

#include <QDBusConnection>
#include <QDBusServiceWatcher>
#include <QObject>
#include <QVariantMap>

#include <memory>

namespace HmiVehicle {

class CallManagerProxy;
class OfonoProxy;
class VehicleService;

/// \brief Lets the calls of a modem (oFono) be the vehicle's calls while there is one on the bus.
///
/// The first modem that can call is used, one call at a time: the one that came first. All calls on the bus are
/// asynchronous. Needs the event loop of the service's thread.
class ModemPhone : public QObject, private PhoneRemote
{
    Q_OBJECT

public:
    /// \brief \a service must outlive this, so it is no parent for it.
    ModemPhone(const QDBusConnection& bus, VehicleService& service, QObject* parent = nullptr);
    ~ModemPhone() override;

    /// \brief The modem's path on the bus, empty without one.
    QString modem() const { return m_manager ? m_modem : QString(); }

private:
    void dial(const QString& number) override;
    void answer() override;
    void hangUp() override;

    void find();
    void findModem();
    void watchModem(const QString& path);
    void useModem();
    void leave();
    void addCall(const QString& path, const QVariantMap& properties);
    void removeCall(const QString& path);
    void takeProperty(const QString& name, const QVariant& value);
    void send(const QString& path, const QString& interface, const QString& method, const QVariantList& arguments = {});

    QDBusConnection m_bus;
    VehicleService& m_service;
    QDBusServiceWatcher m_watcher;
    QString m_owner;
    QString m_modem;
    std::unique_ptr<OfonoProxy> m_modemProxy;
    std::unique_ptr<CallManagerProxy> m_manager;
    std::unique_ptr<OfonoProxy> m_callProxy;
    QString m_call; ///< path, empty without one
    QString m_state;
    QString m_number;
    QString m_name;
};

} // namespace HmiVehicle
