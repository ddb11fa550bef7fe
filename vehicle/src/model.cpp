// SPDX-License-Identifier: MIT
#include "model.h"

#include <utility>

namespace HmiVehicle {

Model::Model(const char* source, Scheduler& scheduler)
    : m_source(QString::fromLatin1(source))
    , m_scheduler(scheduler)
{
}

Model::~Model() = default;

QJsonObject Model::takeChanges()
{
    return std::exchange(m_changes, QJsonObject());
}

void Model::call(const QString& name, const QJsonArray& arguments)
{
    if (const Handler handler = m_handlers.value(name))
        handler(arguments);
}

void Model::set(const char* field, const QJsonValue& value)
{
    const QString name = QString::fromLatin1(field);
    if (m_state.value(name) == value)
        return;
    m_state.insert(name, value);
    m_changes.insert(name, value);
}

bool Model::assign(const QString& field, const QJsonValue& value)
{
    set(field.toLatin1().constData(), value);
    return true;
}

void Model::on(const char* call, const Handler& handler)
{
    m_handlers.insert(QString::fromLatin1(call), handler);
}

void Model::on(const char* call, const std::function<void()>& handler)
{
    on(call, [handler](const QJsonArray&) { handler(); });
}

} // namespace HmiVehicle
