// SPDX-License-Identifier: MIT
#include "player.h"

#include "exitcodes.h"

#include <QTextStream>

#include <unistd.h>

namespace {
constexpr int startTime = 60000; ///< milliseconds that an HMI is given to come
} // namespace

Player::Player(const Options& options, QObject* parent)
    : QObject(parent)
    , m_options(options)
{
}

int Player::start()
{
    return HmiVehicle::Scenario::isRecording(m_options.file) ? playRecording() : playScenario();
}

int Player::playRecording()
{
    m_replay = std::make_unique<HmiVehicle::Replay>();
    m_directory = std::make_unique<HmiVehicle::VehicleDirectory>();
    if (!m_replay->load(m_options.file)) {
        QTextStream(stderr) << m_replay->errorString() << '\n';
        return wrongUsage;
    }
    connect(m_directory.get(), &HmiVehicle::VehicleDirectory::connected, m_replay.get(),
            &HmiVehicle::Replay::addConnection);
    connect(m_directory.get(), &HmiVehicle::VehicleDirectory::controlConnected, this,
            [](int socket) { ::close(socket); }); // there is no vehicle to be controlled
    connect(m_replay.get(), &HmiVehicle::Replay::finished, this, &Player::compare);
    if (!m_directory->listen(m_options.directory)) {
        QTextStream(stderr) << "vehicle-sim: " << m_directory->errorString() << '\n';
        return failed;
    }
    m_replay->play(m_options.speed);
    startHmi();
    return 0;
}

void Player::compare(const QString& problem)
{
    const QStringList differences = m_replay->differences();
    QTextStream errors(stderr);
    if (!m_replay->errorString().isEmpty())
        errors << m_replay->errorString() << '\n';
    for (const QString& difference : differences)
        errors << difference << '\n';
    if (!problem.isEmpty())
        errors << "vehicle-sim: " << problem << '\n';
    Q_EMIT finished(problem.isEmpty() && differences.isEmpty() ? 0 : failed);
}

int Player::playScenario()
{
    HmiVehicle::Scenario scenario;
    if (!scenario.load(m_options.file)) {
        QTextStream(stderr) << scenario.errorString() << '\n';
        return wrongUsage;
    }
    const bool serves = !HmiVehicle::ControlClient().open(m_options.directory);
    if (serves && !serve())
        return failed;

    CommandRunner::Steps steps;
    if (serves || !m_options.hmi.isEmpty())
        steps.push_back({m_options.file, {QStringLiteral("expect"), QStringLiteral("hmi")}, startTime});
    steps.push_back({m_options.file, {QStringLiteral("forget")}, -1});
    for (HmiVehicle::Scenario::Step step : scenario.steps()) {
        if (step.timeout < 0)
            step.timeout = m_options.timeout;
        steps.push_back(step);
    }
    m_runner = std::make_unique<CommandRunner>(steps);
    connect(m_runner.get(), &CommandRunner::finished, this, [this](bool done) { Q_EMIT finished(done ? 0 : failed); });
    if (!m_runner->start(m_options.directory))
        return failed;
    startHmi();
    return 0;
}

void Player::startHmi()
{
    if (m_options.hmi.isEmpty())
        return;
    m_hmi = std::make_unique<HmiProcess>();
    connect(m_hmi.get(), &HmiProcess::ended, this, &Player::fail);
    m_hmi->start(m_options.hmi, m_options.directory);
}

bool Player::serve()
{
    HmiVehicle::Vehicle::Options options;
    options.frozen = m_options.frozen;
    options.speed = m_options.speed;
    m_server = std::make_unique<Server>(options);
    if (m_server->listen(m_options.directory))
        return true;
    QTextStream(stderr) << "vehicle-sim: " << m_server->errorString() << '\n';
    return false;
}

void Player::fail(const QString& problem)
{
    QTextStream(stderr) << "vehicle-sim: " << problem << '\n';
    Q_EMIT finished(failed);
}
