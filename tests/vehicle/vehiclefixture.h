// SPDX-License-Identifier: MIT
#pragma once

#include "logcapture.h"

#include <HmiVehicle/vehicle.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTest>

#include <memory>

using namespace HmiVehicle;

/// A test of a vehicle of its own, which is called and for which time passes as the test wants; no sockets, no clock.
class VehicleFixture : public QObject
{
    Q_OBJECT

protected:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<Vehicle> m_vehicle;
    QList<QPair<Channel, QByteArray>> m_sent;

    void make(bool frozen = false)
    {
        Vehicle::Options options;
        options.frozen = frozen;
        m_sent.clear();
        m_vehicle = std::make_unique<Vehicle>(options, [this](Channel channel, const QByteArray& line) {
            m_sent.append({channel, line});
        });
    }

    QString call(const char* source, const char* name, const QJsonArray& arguments = {},
                 Channel channel = Channel::Messages)
    {
        const QJsonObject line{{QStringLiteral("source"), QString::fromLatin1(source)},
                               {QStringLiteral("call"), QString::fromLatin1(name)},
                               {QStringLiteral("args"), arguments}};
        return m_vehicle->receive(channel, QJsonDocument(line).toJson(QJsonDocument::Compact));
    }

    QJsonValue value(const char* source, const char* field) const
    {
        return m_vehicle->state(QString::fromLatin1(source)).value(QLatin1String(field));
    }

    QString textOf(const char* source, const char* field) const { return value(source, field).toString(); }
    int number(const char* source, const char* field) const { return value(source, field).toInt(-999); }

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        make();
    }

    void cleanup()
    {
        m_vehicle.reset();
        m_log.reset();
    }
};
