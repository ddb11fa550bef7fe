// SPDX-License-Identifier: MIT
#include "commandrunner.h"
#include "desktop.h"
#include "devices.h"
#include "exitcodes.h"
#include "options.h"
#include "player.h"
#include "server.h"

#include <HmiVehicle/controlpanel.h>
#include <HmiVehicle/endsignals.h>

#include <QGuiApplication>
#include <QTextStream>
#include <QTime>

#include <algorithm>
#include <memory>

using HmiVehicle::ControlPanel;

namespace {

int serve(const Options& options)
{
    HmiVehicle::Vehicle::Options vehicle;
    vehicle.frozen = options.frozen;
    vehicle.speed = options.speed;
    if (!options.frozen)
        vehicle.startTime = QTime::currentTime();
    Server server(vehicle);
    if (!server.listen(options.directory)) {
        QTextStream(stderr) << "vehicle-sim: " << server.errorString() << '\n';
        return failed;
    }
    QObject extras; // goes before the service
    QString problem = useDevices(options.devices, options.keyMap, server.service(), &extras);
    if (problem.isEmpty())
        problem = useDesktop(options.desktopPlayer, options.modem, server.service(), &extras);
    if (!problem.isEmpty()) {
        QTextStream(stderr) << "vehicle-sim: " << problem << '\n';
        return failed;
    }
    ControlPanel panel(server.service());
    if (options.panel && !panel.show())
        return failed;
    QTextStream(stdout) << "vehicle-sim serves " << options.directory << '\n' << Qt::flush;
    if (!options.pictureFile.isEmpty())
        return panel.savePicture(options.pictureFile) ? 0 : failed;
    return QCoreApplication::exec();
}

int send(const Options& options)
{
    CommandRunner::Steps steps;
    for (const QStringList& words : options.commands)
        steps.push_back({QString(), words, options.timeout});
    CommandRunner runner(steps);
    QObject::connect(&runner, &CommandRunner::finished, [](bool done) { QCoreApplication::exit(done ? 0 : failed); });
    return runner.start(options.directory) ? QCoreApplication::exec() : failed;
}

int play(const Options& options)
{
    Player player(options);
    QObject::connect(&player, &Player::finished, [](int code) { QCoreApplication::exit(code); });
    const int problem = player.start();
    return problem ? problem : QCoreApplication::exec();
}

int run(const Options& options)
{
    switch (options.task) {
    case Options::Serve:
        return serve(options);
    case Options::Send:
        return send(options);
    case Options::Play:
        return play(options);
    case Options::ShowHelp:
        QTextStream(stdout) << options.message;
    }
    return 0;
}

/// A display is needed by the panel only. The options can be read when there is an application, so their beginning has to do.
std::unique_ptr<QCoreApplication> makeApplication(int& argc, char** argv)
{
    const auto asksFor = [argc, argv](const char* option) {
        return std::any_of(argv, argv + argc,
                           [option](const char* word) { return qstrncmp(word, option, uint(qstrlen(option))) == 0; });
    };
    if (!asksFor("--panel"))
        return std::make_unique<QCoreApplication>(argc, argv);
    if (asksFor("--panel-shot")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
        qputenv("QT_QUICK_BACKEND", "software");
    }
    return std::make_unique<QGuiApplication>(argc, argv);
}

} // namespace

int main(int argc, char** argv)
{
    const std::unique_ptr<QCoreApplication> application = makeApplication(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("vehicle-sim"));
    Options options;
    if (!options.parse(QCoreApplication::arguments())) {
        QTextStream(stderr) << "vehicle-sim: " << options.message << '\n';
        return wrongUsage;
    }
    HmiVehicle::EndSignals endSignals; // so that the sockets are removed
    endSignals.quitEventLoop();
    return run(options);
}
