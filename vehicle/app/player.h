// SPDX-License-Identifier: MIT
#pragma once

#include "commandrunner.h"
#include "hmiprocess.h"
#include "options.h"
#include "replay.h"
#include "server.h"

#include <QObject>

#include <memory>

/// Plays a scenario to the vehicle that serves a directory, or else to one of its own; or a recording as the other end. With an
/// HMI of its own if wanted.
class Player : public QObject
{
    Q_OBJECT

public:
    explicit Player(const Options& options, QObject* parent = nullptr);

    /// 0 when it has begun, else the exit code; a message is on the standard error output then.
    int start();

Q_SIGNALS:
    void finished(int exitCode);

private:
    int playScenario();
    int playRecording();
    bool serve();
    void startHmi();
    void compare(const QString& problem);
    void fail(const QString& problem);

    const Options m_options;
    std::unique_ptr<Server> m_server;
    std::unique_ptr<HmiVehicle::VehicleDirectory> m_directory; ///< of a replay
    std::unique_ptr<HmiVehicle::Replay> m_replay;
    std::unique_ptr<CommandRunner> m_runner;
    std::unique_ptr<HmiProcess> m_hmi;
};
