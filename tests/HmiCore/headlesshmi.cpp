// SPDX-License-Identifier: MIT
// A head unit that starts, tells on its standard output everything that is logged, and ends. Tests run it as a process
// of its own in directories that they lay out. Arguments: what to do after the start.
#include "recordinginitializer.h"

#include <HmiCore/HmiApplication>
#include <HmiGuiFramework/AppSettings>

#include <QDir>
#include <QTimer>
#include <QWindow>

#include <cstdio>

namespace {

void print(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    const char* const level = type == QtDebugMsg ? "D" : type == QtWarningMsg ? "W" : "E";
    std::printf("%s %s: %s\n", level, context.category, message.toUtf8().constData());
    std::fflush(stdout);
}

} // namespace

int main(int argc, char** argv)
{
    qInstallMessageHandler(print);
    HmiCore::HmiApplication app(argc, argv);
    const QStringList arguments = app.arguments();
    if (arguments.contains(QStringLiteral("constructOnly")))
        return 0;

    QDir base(QCoreApplication::applicationDirPath());
    HmiCore::HmiApplication::moveToBaseDir(base);
    HmiGuiFramework::AppSettings::mainFolderPath = base.absolutePath() + QLatin1Char('/');
    RecordingInitializer initializer(QStringLiteral("views/root.json"), arguments.contains(QStringLiteral("rootViews"))
                                                                            ? QStringLiteral("ROOT")
                                                                            : QString());
    app.initialize(&initializer);
    qDebug().noquote() << "home" << HmiCore::HmiManager::instance()->factoryDefaultHomeState();
    if (!arguments.contains(QStringLiteral("run")))
        return 0;

    QObject::connect(
        HmiCore::HmiManager::instance(), &HmiCore::HmiManager::hmiThemeSync, &app,
        [] {
            const bool running = HmiStateMachine::StateMachine::instance()->isRunning();
            const bool shown =
                QGuiApplication::allWindows().value(0) && QGuiApplication::allWindows().first()->isVisible();
            qDebug("machine %s, window %s", running ? "running" : "stopped", shown ? "shown" : "hidden");
            QCoreApplication::quit();
        },
        Qt::QueuedConnection);
    app.startHmi();
    QTimer::singleShot(0, HmiCore::HmiManager::instance(), &HmiCore::HmiManager::showHmiUI);
    return app.exec();
}
