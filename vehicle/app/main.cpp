// SPDX-License-Identifier: MIT
#include <HmiVehicle/vehicledirectory.h>
#include <HmiVehicle/vehicleservice.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QSocketNotifier>
#include <QTextStream>

#include <csignal>
#include <sys/signalfd.h>
#include <unistd.h>

namespace {

/// Ends the event loop on SIGINT and SIGTERM, so that the sockets are removed.
int openEndSignals()
{
    sigset_t signalsToEnd;
    sigemptyset(&signalsToEnd);
    sigaddset(&signalsToEnd, SIGINT);
    sigaddset(&signalsToEnd, SIGTERM);
    sigprocmask(SIG_BLOCK, &signalsToEnd, nullptr);
    return ::signalfd(-1, &signalsToEnd, SFD_CLOEXEC | SFD_NONBLOCK);
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("vehicle-sim"));
    QCommandLineParser parser;
    parser.setApplicationDescription(
        QStringLiteral("A simulated vehicle: the application layer that an HMI connects to."));
    parser.addHelpOption();
    const QCommandLineOption directoryOption(QStringLiteral("dir"), QStringLiteral("Directory of the sockets."),
                                             QStringLiteral("directory"), HmiVehicle::VehicleDirectory::defaultPath());
    const QCommandLineOption frozenOption(QStringLiteral("frozen"), QStringLiteral("Let time stand still at 10:42."));
    parser.addOption(directoryOption);
    parser.addOption(frozenOption);
    parser.process(application);
    if (!parser.positionalArguments().isEmpty()) {
        QTextStream(stderr) << "vehicle-sim: unexpected argument: " << parser.positionalArguments().constFirst()
                            << '\n';
        return 2;
    }

    HmiVehicle::Vehicle::Options options;
    options.frozen = parser.isSet(frozenOption);
    if (!options.frozen)
        options.startTime = QTime::currentTime();
    HmiVehicle::VehicleService service(options);
    HmiVehicle::VehicleDirectory directory;
    QObject::connect(&directory, &HmiVehicle::VehicleDirectory::connected, &service,
                     &HmiVehicle::VehicleService::addConnection);
    if (!directory.listen(parser.value(directoryOption))) {
        QTextStream(stderr) << "vehicle-sim: " << directory.errorString() << '\n';
        return 1;
    }
    QSocketNotifier endSignal(openEndSignals(), QSocketNotifier::Read);
    QObject::connect(&endSignal, &QSocketNotifier::activated, &application, &QCoreApplication::quit);
    QTextStream(stdout) << "vehicle-sim serves " << parser.value(directoryOption) << '\n' << Qt::flush;
    return application.exec();
}
