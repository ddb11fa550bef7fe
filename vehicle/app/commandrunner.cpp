// SPDX-License-Identifier: MIT
#include "commandrunner.h"

#include "expectation.h"

#include <QTextStream>

#include <utility>

CommandRunner::CommandRunner(Steps steps, QObject* parent)
    : QObject(parent)
    , m_steps(std::move(steps))
{
    connect(&m_client, &HmiVehicle::ControlClient::replied, this, &CommandRunner::take);
    connect(&m_client, &HmiVehicle::ControlClient::lost, this,
            [this] { end(QStringLiteral("the vehicle went away")); });
}

bool CommandRunner::start(const QString& directory)
{
    if (!m_client.open(directory)) {
        QTextStream(stderr) << "vehicle-sim: " << m_client.errorString() << '\n';
        return false;
    }
    next();
    return true;
}

void CommandRunner::next()
{
    if (m_step == m_steps.size())
        return end(QString());
    m_number = m_client.send(m_steps[m_step].words, m_steps[m_step].timeout);
}

void CommandRunner::take(int number, const QString& problem, const QJsonValue& value)
{
    if (number != m_number)
        return;
    if (!problem.isEmpty())
        return end(problem);
    if (!value.isNull())
        QTextStream(stdout) << HmiVehicle::wordFromValue(value) << '\n';
    ++m_step;
    next();
}

void CommandRunner::end(const QString& problem)
{
    m_client.disconnect(this);
    if (!problem.isEmpty()) {
        const QString where = m_steps[m_step].where;
        QTextStream(stderr) << (where.isEmpty() ? QStringLiteral("vehicle-sim") : where) << ": " << problem << '\n';
    }
    QMetaObject::invokeMethod(
        this, [this, done = problem.isEmpty()] { Q_EMIT finished(done); }, Qt::QueuedConnection);
}
