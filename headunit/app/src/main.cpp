// SPDX-License-Identifier: MIT
#include "commandline.h"
#include "keyboard.h"
#include "productinitializer.h"
#include "screenshot.h"
#include "settings.h"
#include "startupformats.h"
#include "startupreport.h"
#include "tour.h"
#include "vehiclekeys.h"

#include <AL2HMIBridge/BridgeEndpoint>
#include <AL2HMIBridge/BridgeRecorder>
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiManager>
#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiGuiFramework/WindowManager>
#include <HmiLogging/MessageHandler>
#include <HmiStateMachine/StateMachine>
#include <HmiVehicle/embeddedvehicle.h>
#include <HmiVehicle/endsignals.h>

#include <QTextStream>

#include <optional>

using AL2HMIBridge::BridgeEndpoint;
using AL2HMIBridge::BridgeRecorder;
using HmiCore::HmiApplication;
using HmiCore::HmiManager;
using HmiGuiFramework::AppSettings;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;
using HmiStateMachine::StateMachine;
using HmiVehicle::EmbeddedVehicle;

namespace {

constexpr int cannotRun = 1;
constexpr int wrongUsage = 2;
constexpr int paceOfTour = 1200; // ms

/// Pictures are drawn without a display and without the pace of one.
void drawOffScreen()
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("QT_QUICK_BACKEND", "software");
}

EmbeddedVehicle* vehicle = nullptr;

/// The bridge connects as soon as the application object exists, and the vehicle's thread needs that object: so the vehicle
/// starts while the object is made, and stops while it is destroyed.
void useEmbeddedVehicle(const CommandLine& commandLine, bool frozen)
{
    HmiVehicle::Vehicle::Options options;
    options.frozen = frozen;
    if (commandLine.country >= 0)
        options.destinationCountry = commandLine.country;
    if (commandLine.language >= 0)
        options.systemLanguage = commandLine.language;
    static EmbeddedVehicle embedded(options);
    vehicle = &embedded;
    qAddPreRoutine([] { vehicle->start(); });
    qAddPostRoutine([] { vehicle->stop(); });
    BridgeEndpoint::setConnector(
        [](BridgeEndpoint::Channel channel) { return vehicle->connectChannel(BridgeEndpoint::channelName(channel)); });
}

int listViews()
{
    const auto descriptor = DataStore::get<ViewManager>(QStringLiteral("ViewManager"))->guiDescriptor();
    QStringList names = descriptor.views.keys();
    names += descriptor.popups.keys();
    names.sort();
    QTextStream(stdout) << names.join(QLatin1Char('\n')) << '\n';
    return 0;
}

/// The keyboard of the PC presses the vehicle's hard keys. The window owns what does that.
void connectKeyboard(const CommandLine& commandLine)
{
    auto* const windows = DataStore::get<HmiGuiFramework::WindowManager>(QStringLiteral("WindowManager"));
    new Keyboard(windows->hmiWindow(), vehicle ? keysOf(vehicle) : keysOf(commandLine.vehicleDirectory));
}

void showFirst(const QString& view)
{
    QObject::connect(StateMachine::instance(), &QStateMachine::started, StateMachine::instance(), [view] {
        auto* const views = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
        if (views->guiDescriptor().popups.contains(view))
            views->requestPopup(view);
        else
            views->requestView(view);
    });
}

/// With a display the tour is for somebody who looks on.
void lead(HmiApplication& application, const CommandLine& commandLine, const TourFile& file)
{
    Tour::Options options;
    options.pictures = commandLine.pictures;
    options.pace = QGuiApplication::platformName() == QLatin1String("offscreen") ? 0 : paceOfTour;
    auto* const tour = new Tour(file, *vehicle, options, &application);
    QObject::connect(tour, &Tour::captionChanged, tour, [tour] { QTextStream(stdout) << tour->caption() << Qt::endl; });
    QObject::connect(tour, &Tour::finished, tour, [](const QString& failure) {
        if (!failure.isEmpty())
            QTextStream(stderr) << "headunit: " << failure << '\n';
        QCoreApplication::exit(failure.isEmpty() ? 0 : cannotRun);
    });
    tour->start();
}

/// Writes the report when the first frame is there, and ends.
void writeReport(StartupReport& report, const QString& file)
{
    report.attachWindow();
    QObject::connect(&report, &StartupReport::complete, QCoreApplication::instance(), [&report, file] {
        QString error;
        const bool isWritten = StartupReport::write(report.timeline(), file, &error);
        if (isWritten)
            QTextStream(stdout) << StartupFormats::table(report.timeline()) << file << '\n'
                                << StartupReport::traceFile(file) << '\n';
        else
            QTextStream(stderr) << "headunit: " << error << '\n';
        QCoreApplication::exit(isWritten ? 0 : cannotRun);
    });
}

int run(HmiApplication& application, const CommandLine& commandLine, StartupReport* report)
{
    ProductInitializer initializer(commandLine.night);
    if (report)
        report->attachModules();
    application.initialize(&initializer);
    if (report)
        writeReport(*report, commandLine.startupReport);
    if (commandLine.listViews)
        return listViews();
    TourFile tour;
    if (!commandLine.tourFile.isEmpty() && !tour.load(commandLine.tourFile)) {
        QTextStream(stderr) << "headunit: " << tour.errorString() << '\n';
        return wrongUsage;
    }
    QString unknown;
    if (!commandLine.view.isEmpty() && !Screenshot::isKnown(commandLine.view, &unknown)) {
        QTextStream(stderr) << "headunit: " << unknown << '\n';
        return wrongUsage;
    }
    application.startHmi();
    Q_EMIT HmiManager::instance()->showHmiUI();

    if (!commandLine.tourFile.isEmpty()) {
        lead(application, commandLine, tour);
    } else if (!commandLine.shotFile.isEmpty()) {
        auto* const screenshot = new Screenshot(commandLine.shotFile, commandLine.view, &application);
        screenshot->start();
    } else {
        connectKeyboard(commandLine);
        if (!commandLine.view.isEmpty())
            showFirst(commandLine.view);
    }
    return application.exec();
}

} // namespace

int main(int argc, char** argv)
{
    QStringList arguments;
    for (int i = 0; i < argc; ++i)
        arguments.append(QString::fromLocal8Bit(argv[i]));
    const CommandLine commandLine = CommandLine::parse(arguments);
    if (commandLine.outcome != CommandLine::Run) {
        QTextStream(commandLine.outcome == CommandLine::Done ? stdout : stderr) << commandLine.message << '\n';
        return commandLine.outcome == CommandLine::Done ? 0 : wrongUsage;
    }

    const HmiLogging::MessageHandler messageHandler(QStringLiteral("HMI"));
    std::optional<StartupReport> report;
    if (!commandLine.startupReport.isEmpty())
        report.emplace();
    const bool headless = !commandLine.shotFile.isEmpty() || !commandLine.pictures.isEmpty() || commandLine.listViews;
    if (headless)
        drawOffScreen();

    if (commandLine.vehicleDirectory.isEmpty())
        useEmbeddedVehicle(commandLine, headless || !commandLine.tourFile.isEmpty());
    else
        BridgeEndpoint::setDirectory(commandLine.vehicleDirectory);

    std::optional<HmiVehicle::EndSignals> endSignals; // a recording is whole when they end it
    if (!commandLine.recordFile.isEmpty())
        endSignals.emplace();
    BridgeRecorder recorder; // before the application object, whose construction starts the traffic
    if (!commandLine.recordFile.isEmpty() && !recorder.start(commandLine.recordFile)) {
        QTextStream(stderr) << "headunit: " << recorder.errorString() << '\n';
        return cannotRun;
    }

    HmiApplication application(argc, argv);
    if (endSignals)
        endSignals->quitEventLoop();
    applySettings(commandLine.size);
    AppSettings::instance()->setAnimations(!headless && !report);
    return run(application, commandLine, report ? &*report : nullptr);
}
