// SPDX-License-Identifier: MIT
#pragma once

#include "scheduler.h"

#include <QHash>
#include <QJsonArray>
#include <QJsonObject>
#include <QString>

#include <functional>

namespace HmiVehicle {

/// One source of the vehicle: its state and its answers to calls. The vehicle sends what changed.
class Model
{
public:
    virtual ~Model();
    Model(const Model&) = delete;
    Model& operator=(const Model&) = delete;

    const QString& source() const { return m_source; }
    const QJsonObject& state() const { return m_state; }
    /// What changed since the last time.
    QJsonObject takeChanges();

    bool answers(const QString& call) const { return m_handlers.contains(call); }
    void call(const QString& name, const QJsonArray& arguments);

    QJsonValue value(const char* field) const { return m_state.value(QLatin1String(field)); }
    void set(const char* field, const QJsonValue& value);
    /// As a switch on a control panel does; the value has been checked against the table. False when it cannot be now.
    virtual bool assign(const QString& field, const QJsonValue& value);

protected:
    Model(const char* source, Scheduler& scheduler);

    using Handler = std::function<void(const QJsonArray& arguments)>;
    void on(const char* call, const Handler& handler);
    void on(const char* call, const std::function<void()>& handler);

    Scheduler& scheduler() { return m_scheduler; }
    const Scheduler& scheduler() const { return m_scheduler; }

private:
    const QString m_source;
    Scheduler& m_scheduler;
    QJsonObject m_state;
    QJsonObject m_changes;
    QHash<QString, Handler> m_handlers;
};

} // namespace HmiVehicle
