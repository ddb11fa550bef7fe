// SPDX-License-Identifier: MIT
#include "commandline.h"
#include "productinitializer.h"
#include "screenshot.h"
#include "settings.h"

#include <AL2HMIBridge/BridgeEndpoint>
#include <AL2HMIBridge/BridgeRecorder>
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiManager>
#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiLogging/MessageHandler>
#include <HmiVehicle/embeddedvehicle.h>

#include <QTextStream>

using AL2HMIBridge::BridgeEndpoint;
using AL2HMIBridge::BridgeRecorder;
using HmiCore::HmiApplication;
using HmiCore::HmiManager;
using HmiGuiFramework::AppSettings;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;
using HmiVehicle::EmbeddedVehicle;

namespace {

constexpr int cannotRun = 1;
constexpr int wrongUsage = 2;

/// Pictures are drawn without a display and without the pace of one.
void drawOffScreen()
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("QT_QUICK_BACKEND", "software");
}

EmbeddedVehicle* vehicle = nullptr;

/// The bridge connects as soon as the application object exists, and the vehicle's thread needs that object: so the vehicle
/// starts while the object is made, and stops while it is destroyed.
void useEmbeddedVehicle(bool frozen)
{
    HmiVehicle::Vehicle::Options options;
    options.frozen = frozen;
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
    QStringList names = descriptor.views.keys() + descriptor.popups.keys();
    names.sort();
    QTextStream(stdout) << names.join(QLatin1Char('\n')) << '\n';
    return 0;
}

int run(HmiApplication& application, const CommandLine& commandLine)
{
    ProductInitializer initializer(commandLine.night);
    application.initialize(&initializer);
    if (commandLine.listViews)
        return listViews();
    QString unknown;
    if (!commandLine.view.isEmpty() && !Screenshot::isKnown(commandLine.view, &unknown)) {
        QTextStream(stderr) << "headunit: " << unknown << '\n';
        return wrongUsage;
    }
    application.startHmi();
    Q_EMIT HmiManager::instance()->showHmiUI();

    if (!commandLine.shotFile.isEmpty()) {
        auto* const screenshot = new Screenshot(commandLine.shotFile, commandLine.view, &application);
        screenshot->start();
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
    const bool headless = !commandLine.shotFile.isEmpty() || commandLine.listViews;
    if (headless)
        drawOffScreen();

    if (commandLine.vehicleDirectory.isEmpty())
        useEmbeddedVehicle(headless);
    else
        BridgeEndpoint::setDirectory(commandLine.vehicleDirectory);

    BridgeRecorder recorder; // before the application object, whose construction starts the traffic
    if (!commandLine.recordFile.isEmpty() && !recorder.start(commandLine.recordFile)) {
        QTextStream(stderr) << "headunit: " << recorder.errorString() << '\n';
        return cannotRun;
    }

    HmiApplication application(argc, argv);
    applySettings(commandLine.size);
    AppSettings::instance()->setAnimations(!headless);
    return run(application, commandLine);
}
