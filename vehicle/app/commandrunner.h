// SPDX-License-Identifier: MIT
#pragma once

#include "scenario.h"

#include <HmiVehicle/controlclient.h>

#include <QObject>

#include <vector>

/// Sends commands to a vehicle, one after the other, and stops at the first that fails. Prints what they ask for.
class CommandRunner : public QObject
{
    Q_OBJECT

public:
    using Steps = std::vector<HmiVehicle::Scenario::Step>;

    explicit CommandRunner(Steps steps, QObject* parent = nullptr);

    /// False, with a message on the standard error output, when no vehicle serves the directory.
    bool start(const QString& directory);

Q_SIGNALS:
    void finished(bool done);

private:
    void next();
    void take(int number, const QString& problem, const QJsonValue& value);
    void end(const QString& problem);

    const Steps m_steps;
    HmiVehicle::ControlClient m_client;
    size_t m_step = 0;
    int m_number = 0;
};
