// SPDX-License-Identifier: MIT
#include "startupreport.h"

#include "startupformats.h"

#include <HmiCore/HmiManager>
#include <HmiCore/HmiModuleRootModel>
#include <HmiCore/hmicore.h>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/HmiQQuickWindow>
#include <HmiGuiFramework/ViewManager>
#include <HmiGuiFramework/WindowManager>
#include <HmiLogging/HmiLogging>
#include <HmiStateMachine/StateMachine>

#include <QFileInfo>
#include <QLoggingCategory>
#include <QSaveFile>
#include <QThread>

#include <ctime>

using HmiCore::HmiManager;
using HmiCore::HmiModuleRootModel;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;
using HmiGuiFramework::WindowManager;
using HmiStateMachine::StateMachine;

namespace {

enum class Source { Core, Performance };

struct Milestone
{
    Source source;
    const char* line;  ///< the beginning of the line that tells of it
    const char* phase; ///< that ends with it
};

const Milestone milestones[] = {
    {Source::Performance, "starting receive threads", "Application object, QML engine"},
    {Source::Performance, "initializing application", "Receive threads, settings"},
    {Source::Performance, "AL Source objects initialized", "Sources"},
    {Source::Performance, "Initialized qml types registered", "QML types"},
    {Source::Performance, "Initialized qml objects exported", "The product's objects for QML"},
    {Source::Performance, "Top state tree built.", "Top state tree"},
    {Source::Performance, "beginning postInit", "Menu, engine factories"},
    {Source::Performance, "finished postInit", "Language"},
    {Source::Core, "Framework imports path set.", "Image providers, models for QML"},
    {Source::Core, "Framework objects exported.", "GUI framework"},
    {Source::Core, "Looking for plugins in:", "Views of the root hierarchy"},
    {Source::Core, "Loaded ", "Module plugins"},
};

StartupReport* active = nullptr;

qint64 nanoseconds(clockid_t clock)
{
    timespec time{};
    ::clock_gettime(clock, &time);
    return qint64(time.tv_sec) * 1'000'000'000 + time.tv_nsec;
}

const char* categoryOf(Source source)
{
    return source == Source::Core ? HmiCore::hmicore().categoryName() : HmiLogging::hmiperformance().categoryName();
}

bool write(const QString& name, const QByteArray& content, QString* error)
{
    QSaveFile file(name);
    if (file.open(QIODevice::WriteOnly) && file.write(content) == content.size() && file.commit())
        return true;
    *error = QStringLiteral("Cannot write '%1': %2").arg(name, file.errorString());
    return false;
}

} // namespace

void readMilestone(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    if (type != QtDebugMsg || !active || QThread::currentThread() != active->thread()) {
        if (active && active->m_previous)
            active->m_previous(type, context, message);
        return;
    }
    for (const Milestone& milestone : milestones)
        if (qstrcmp(context.category, categoryOf(milestone.source)) == 0
            && message.startsWith(QLatin1String(milestone.line)))
            active->endPhase(QString::fromLatin1(milestone.phase));
}

StartupReport::StartupReport()
{
    // Until here the process has done nothing but work: its libraries were loaded and relocated.
    const qint64 beforeMain = nanoseconds(CLOCK_PROCESS_CPUTIME_ID);
    m_start = nanoseconds(CLOCK_MONOTONIC) - beforeMain;
    m_timeline.endPhase(QStringLiteral("Loading libraries (CPU time)"), beforeMain);
    active = this;
    m_previous = qInstallMessageHandler(&readMilestone);
    QLoggingCategory::setFilterRules(
        QStringLiteral("%1.debug=true\n%2.debug=true")
            .arg(QLatin1String(categoryOf(Source::Core)), QLatin1String(categoryOf(Source::Performance))));
}

StartupReport::~StartupReport()
{
    qInstallMessageHandler(m_previous);
    QLoggingCategory::setFilterRules(QString());
    active = nullptr;
}

void StartupReport::endPhase(const QString& name)
{
    m_timeline.endPhase(name, nanoseconds(CLOCK_MONOTONIC) - m_start);
}

void StartupReport::attachModules()
{
    HmiModuleRootModel* const modules = HmiManager::instance()->moduleModel();
    connect(modules, &QAbstractItemModel::rowsInserted, this, [this, modules](const QModelIndex&, int row) {
        const QString name = modules->index(row, 0).data(HmiModuleRootModel::ModuleName).toString();
        m_timeline.endStep(name, nanoseconds(CLOCK_MONOTONIC) - m_start);
    });
}

void StartupReport::attachWindow()
{
    endPhase(QStringLiteral("Input engines, registration of modules"));
    connect(StateMachine::instance(), &QStateMachine::started, this,
            [this] { endPhase(QStringLiteral("State machine, window")); });
    connect(DataStore::get<ViewManager>(QStringLiteral("ViewManager")), &ViewManager::currentViewChanged, this, [this] {
        if (!std::exchange(m_hasView, true))
            endPhase(QStringLiteral("First view"));
    });
    QQuickWindow* const window = DataStore::get<WindowManager>(QStringLiteral("WindowManager"))->hmiWindow();
    // Frames before that show an empty window. The signal may come from the thread that draws.
    connect(window, &QQuickWindow::frameSwapped, this, [this, window] {
        if (!m_hasView)
            return;
        window->disconnect(this);
        endPhase(QStringLiteral("First frame with it"));
        Q_EMIT complete();
    });
}

QString StartupReport::traceFile(const QString& file)
{
    const QFileInfo info(file);
    return info.path() + QLatin1Char('/') + info.completeBaseName() + QStringLiteral(".json");
}

bool StartupReport::write(const StartupTimeline& timeline, const QString& file, QString* error)
{
    return ::write(file, StartupFormats::picture(timeline), error)
           && ::write(traceFile(file), StartupFormats::trace(timeline), error);
}
