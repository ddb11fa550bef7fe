// SPDX-License-Identifier: MIT
// A head unit with one view and the plugins beside it. What it does: "frame" runs to the first frame; "plugins" loads the
// plugins as the core does; "dlopen" reads metadata, opens and instantiates the same files by hand.
#include "startclock.h"

#include <HmiCore/HmiApplication>
#include <HmiCore/HmiInitializer>
#include <HmiCore/HmiManager>
#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QDir>
#include <QPluginLoader>
#include <QQuickWindow>

#include <dlfcn.h>

namespace {

class Initializer : public HmiCore::HmiInitializer
{
public:
    void initializeSources() override {}
    void connectPopupStates(const QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>&) override {}
    void completeInitialization() override {}
    void buildTopStateTree() override
    {
        auto* const machine = HmiStateMachine::StateMachine::instance();
        root = new HmiStateMachine::HmiState(QStringLiteral("Modules"), machine);
        machine->setInitialState(root);
        root->setInitialState(new HmiStateMachine::HmiState(QStringLiteral("ROOT.Main"), root));
    }
    HmiStateMachine::HmiState* modulesRootState() override { return root; }
    QString rootHierarchyViewDescriptorPath() override { return QStringLiteral("views/module.json"); }
    QString rootHierarchyViewPrefix() override { return QStringLiteral("ROOT"); }

    HmiStateMachine::HmiState* root = nullptr;
};

void openByHand(const QDir& directory)
{
    const QStringList fileNames = directory.entryList(QDir::Files, QDir::Unsorted);
    for (const QString& fileName : fileNames) {
        const QString path = directory.absoluteFilePath(fileName);
        if (QPluginLoader(path).metaData().isEmpty())
            qFatal("%s is no plugin", qPrintable(path));
        void* const library = dlopen(QFile::encodeName(path).constData(), RTLD_LAZY);
        using Instance = QObject* (*)();
        const auto instance = library ? reinterpret_cast<Instance>(dlsym(library, "qt_plugin_instance")) : nullptr;
        if (!instance || !instance())
            qFatal("%s cannot be opened", qPrintable(path));
    }
}

} // namespace

int main(int argc, char** argv)
{
    HmiCore::HmiApplication app(argc, argv);
    const QString what = app.arguments().at(2);
    QDir base(QCoreApplication::applicationDirPath());
    HmiCore::HmiApplication::moveToBaseDir(base);
    if (what != QStringLiteral("frame")) {
        const long long start = StartClock::now();
        if (what == QStringLiteral("plugins"))
            app.loadPlugins();
        else
            openByHand(base.filePath(QStringLiteral("plugins")));
        StartClock::report(start);
    }
    HmiGuiFramework::AppSettings::mainFolderPath = base.absolutePath() + QLatin1Char('/');
    Initializer initializer;
    app.initialize(&initializer);
    auto* const window = qobject_cast<QQuickWindow*>(QGuiApplication::allWindows().value(0));
    const auto* const views =
        HmiGuiFramework::DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"));
    const long long start = app.arguments().at(1).toLongLong();
    QObject::connect(
        window, &QQuickWindow::frameSwapped, window, [start] { StartClock::report(start); }, Qt::DirectConnection);
    // As in the bare program the window appears with its screen in it.
    QObject::connect(views, &HmiGuiFramework::ViewManager::currentViewChanged, HmiCore::HmiManager::instance(),
                     &HmiCore::HmiManager::showHmiUI);
    app.startHmi();
    return app.exec();
}
