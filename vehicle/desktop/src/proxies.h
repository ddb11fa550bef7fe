// SPDX-License-Identifier: MIT
#pragma once

#include <QDBusAbstractInterface>
#include <QDBusObjectPath>
#include <QDBusVariant>
#include <QVariantMap>

namespace HmiVehicle {

// Signals of objects on a bus; their names are those of the bus. Made for unique names, so that nothing waits for an owner.

class PropertiesProxy : public QDBusAbstractInterface
{
    Q_OBJECT

public:
    PropertiesProxy(const QString& owner, const QString& path, const QDBusConnection& bus)
        : QDBusAbstractInterface(owner, path, "org.freedesktop.DBus.Properties", bus, nullptr)
    {
    }

Q_SIGNALS:
    void PropertiesChanged(const QString& interface, const QVariantMap& changed, const QStringList& invalidated);
};

class CallManagerProxy : public QDBusAbstractInterface
{
    Q_OBJECT

public:
    CallManagerProxy(const QString& owner, const QString& path, const QDBusConnection& bus)
        : QDBusAbstractInterface(owner, path, "org.ofono.VoiceCallManager", bus, nullptr)
    {
    }

Q_SIGNALS:
    void CallAdded(const QDBusObjectPath& path, const QVariantMap& properties);
    void CallRemoved(const QDBusObjectPath& path);
};

/// A modem, or a call: both tell their properties in the same way.
class OfonoProxy : public QDBusAbstractInterface
{
    Q_OBJECT

public:
    OfonoProxy(const QString& owner, const QString& path, const char* interface, const QDBusConnection& bus)
        : QDBusAbstractInterface(owner, path, interface, bus, nullptr)
    {
    }

Q_SIGNALS:
    void PropertyChanged(const QString& name, const QDBusVariant& value);
};

} // namespace HmiVehicle
