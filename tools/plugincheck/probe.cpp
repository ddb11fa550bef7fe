// SPDX-License-Identifier: MIT
#include "probe.h"

#include "elffile.h"
#include "elfsections.h"
#include "enginelanguages.h"
#include "moduledescription.h"
#include "probelog.h"
#include "symbols.h"

#include <AL2HMIBridge/BridgeEndpoint>
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiInitializer>
#include <HmiCore/HmiModuleIntegration>
#include <HmiCore/InputMethodEngineInterface>
#include <HmiCore/ModuleInterface>
#include <HmiCore/hmicore.h>
#include <HmiGuiFramework/AppSettings>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QDir>
#include <QLoggingCategory>
#include <QMutex>
#include <QPluginLoader>
#include <QQmlContext>
#include <QTimer>

#include <cstdlib>
#include <cxxabi.h>
#include <dlfcn.h>
#include <exception>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <unistd.h>

#include <csignal>

using HmiCore::HmiApplication;
using HmiCore::HmiModuleIntegration;
using HmiGuiFramework::AppSettings;
using HmiStateMachine::HmiState;
using HmiStateMachine::PopupState;
using HmiStateMachine::StateMachine;

namespace {

// The core's words for what it makes of a plugin are an interface; this is what they are read for.
const QLatin1String allLoaded("Loaded ");
const QLatin1String refusals[] = {QLatin1String("Failed to create module integration for key = "),
                                  QLatin1String("failed to register input method engine ")};

// What is missing in every head unit of one plugin: a home, a vehicle, and those who do what other modules want done.
const QLatin1String noHome("No inital state found.");
const QLatin1String noHandler("Not a handled intent type: ");
const QLatin1String noVehicle("al2hmi.bridge");

bool isOfLoneliness(const QString& category, const QString& message)
{
    return category == noVehicle || message == noHome || message.startsWith(noHandler);
}

struct Heard
{
    QMutex mutex;
    QStringList keptWarnings; ///< while warnings are kept instead of being problems
    bool keepsWarnings = false;
    int modulesLoaded = -1;
    QJsonArray refusedKeys;
};

/// Never destroyed: a plugin's threads may go on to write when the process has begun to end.
Heard& heard()
{
    static auto* const s_heard = new Heard;
    return *s_heard;
}

/// "Loaded 2 plugins", and `… key = "radio"`.
void readCoreLine(const QString& line)
{
    if (line.startsWith(allLoaded)) {
        heard().modulesLoaded = line.section(QLatin1Char(' '), 1, 1).toInt();
        ProbeLog::enter("register");
    }
    for (const QLatin1String refusal : refusals)
        if (line.contains(refusal))
            heard().refusedKeys += line.section(QLatin1Char('"'), -2, -2);
}

void handleMessage(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    const QMutexLocker locker(&heard().mutex);
    const QLatin1String category(context.category);
    if (category == QLatin1String(HmiCore::hmicore().categoryName()))
        readCoreLine(message);
    if (type == QtFatalMsg)
        ProbeLog::tell({{QStringLiteral("fatal"), message}});
    if (type == QtDebugMsg || type == QtInfoMsg || isOfLoneliness(category, message))
        return;
    if (heard().keepsWarnings)
        heard().keptWarnings += message;
    else
        ProbeLog::addProblem(category + QLatin1String(": ") + message);
}

QStringList takeWarnings()
{
    const QMutexLocker locker(&heard().mutex);
    heard().keepsWarnings = true;
    return std::exchange(heard().keptWarnings, {});
}

/// Nothing catches what a plugin throws, so this is the last that runs.
[[noreturn]] void tellOfException()
{
    QString text = QStringLiteral("called std::terminate()");
    if (const std::type_info* const type = abi::__cxa_current_exception_type()) {
        int status = 0;
        char* const name = abi::__cxa_demangle(type->name(), nullptr, nullptr, &status);
        text = QStringLiteral("threw %1").arg(QString::fromLocal8Bit(name ? name : type->name()));
        try {
            std::rethrow_exception(std::current_exception());
        } catch (const std::exception& exception) {
            text += QStringLiteral(": ") + QString::fromLocal8Bit(exception.what());
        } catch (...) {
        }
    }
    ProbeLog::tell({{QStringLiteral("threw"), text}});
    ::_exit(EXIT_FAILURE);
}

/// A group of its own, so that the plugin's children go with it; no core dumps of other people's mistakes.
void becomeExpendable()
{
    ::setpgid(0, 0);
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    const rlimit none{0, 0};
    ::setrlimit(RLIMIT_CORE, &none);
}

/// A head unit with a start state and nothing else: the states of modules are not entered.
class BareInitializer : public HmiCore::HmiInitializer
{
public:
    void initializeSources() override {}
    void registerQmlTypes() override { HmiCore::registerTypes(); }
    void exportObjects(QQmlContext* rootContext) override { engine = rootContext->engine(); }
    void postInit(HmiCore::HmiManager*) override { ProbeLog::enter("create"); }
    void completeInitialization() override {}
    void buildTopStateTree() override
    {
        StateMachine* const machine = StateMachine::instance();
        m_modules = new HmiState(QStringLiteral("Modules"), machine);
        m_modules->setInitialState(new HmiState(QStringLiteral("Start"), m_modules));
        machine->setInitialState(m_modules);
    }
    void connectPopupStates(const QList<QPair<HmiStateMachine::StateLevel, PopupState*>>& states) override
    {
        for (const auto& state : states)
            if (state.second)
                state.second->setParent(m_modules);
    }
    HmiState* modulesRootState() override { return m_modules; }
    QString rootHierarchyViewDescriptorPath() override { return {}; }
    QString rootHierarchyViewPrefix() override { return {}; }

    QQmlEngine* engine = nullptr;

private:
    HmiState* m_modules = nullptr;
};

enum class Kind { None, Module, Engine };

Kind tellMetaData(const QJsonObject& metaData)
{
    const QString interfaceId = metaData.value(QLatin1String("IID")).toString();
    const QJsonObject own = metaData.value(QLatin1String("MetaData")).toObject();
    Kind kind = Kind::None;
    if (interfaceId == QLatin1String(qobject_interface_iid<HmiCore::ModuleInterface*>()))
        kind = Kind::Module;
    if (interfaceId == QLatin1String(qobject_interface_iid<HmiCore::InputMethodEngineInterface*>()))
        kind = Kind::Engine;
    ProbeLog::tell({{QStringLiteral("isPlugin"), !metaData.isEmpty()},
                    {QStringLiteral("interface"), interfaceId},
                    {QStringLiteral("isKnownInterface"), kind != Kind::None},
                    {QStringLiteral("class"), metaData.value(QLatin1String("className"))},
                    {QStringLiteral("name"), own.value(QLatin1String("Name")).toString()},
                    {QStringLiteral("keys"), own.value(QLatin1String("Keys"))}});
    return kind;
}

bool implementsInterface(QObject* root, Kind kind)
{
    return kind == Kind::Module ? qobject_cast<HmiCore::ModuleInterface*>(root) != nullptr
                                : qobject_cast<HmiCore::InputMethodEngineInterface*>(root) != nullptr;
}

/// The steps of QPluginLoader::instance() one by one, so that it is known which of them fails.
bool load(const QString& file, Kind kind)
{
    const ElfFile library(file);
    QPluginLoader loader(file);
    ProbeLog::enter("load");
    const bool isLoaded = loader.load();
    void* const handle =
        isLoaded ? ::dlopen(QFile::encodeName(loader.fileName()).constData(), RTLD_LAZY | RTLD_NOLOAD) : nullptr;
    ProbeLog::tell({{QStringLiteral("missingSymbols"), QJsonArray::fromStringList(missingSymbols(library, handle))}});
    if (!isLoaded) {
        ProbeLog::tell({{QStringLiteral("loadError"), loader.errorString()}});
        return false;
    }
    ProbeLog::enter("construct");
    QObject* const root = loader.instance();
    if (!root) {
        ProbeLog::tell({{QStringLiteral("loadError"), loader.errorString()}});
        return false;
    }
    const bool isRight = implementsInterface(root, kind);
    ProbeLog::tell({{QStringLiteral("implementsInterface"), isRight}});
    return isRight;
}

void describeModules(HmiApplication* application, QQmlEngine* engine)
{
    QJsonArray modules;
    const auto found = application->findChildren<HmiModuleIntegration*>(QString(), Qt::FindDirectChildrenOnly);
    for (const HmiModuleIntegration* const module : found)
        modules += moduleDescription(*module);
    ProbeLog::tell({{QStringLiteral("modules"), modules},
                    {QStringLiteral("modulesMade"), heard().modulesLoaded},
                    {QStringLiteral("submodules"), submoduleDescriptions()}});
    ProbeLog::enter("qml");
    ProbeLog::tell({{QStringLiteral("views"), viewDescriptions(engine)}});
}

/// What modules put off to the first turns of the event loop.
void runEventLoop(HmiApplication* application)
{
    ProbeLog::enter("run");
    QObject::connect(StateMachine::instance(), &QStateMachine::started, application,
                     [] { QTimer::singleShot(0, QCoreApplication::instance(), &QCoreApplication::quit); });
    application->startHmi();
    HmiApplication::exec();
}

void probe(HmiApplication* application, const QString& plugin)
{
    // As the head unit, which does not let Qt look at what is damaged.
    const bool isSound = HmiCore::hasSoundSections(plugin);
    const Kind kind = tellMetaData(isSound ? QPluginLoader(plugin).metaData() : QJsonObject());
    if (kind == Kind::None || !load(plugin, kind))
        return;

    QDir base(QCoreApplication::applicationDirPath());
    HmiApplication::moveToBaseDir(base);
    AppSettings::mainFolderPath = base.absolutePath() + QLatin1Char('/');
    AppSettings::instance()->setThemeFile(QStringLiteral(":/theme/theme.json"));
    BareInitializer initializer;
    application->initialize(&initializer);
    if (kind == Kind::Module) {
        describeModules(application, initializer.engine);
        ProbeLog::tell({{QStringLiteral("refusedKeys"), heard().refusedKeys}});
    } else {
        ProbeLog::tell({{QStringLiteral("refusedKeys"), heard().refusedKeys}});
        ProbeLog::enter("engines");
        ProbeLog::tell({{QStringLiteral("engines"), engineLanguages(&takeWarnings)}});
    }
    runEventLoop(application);
}

} // namespace

int Probe::run(int& argc, char** argv, const QString& report, const QString& plugin)
{
    becomeExpendable();
    if (!ProbeLog::open(report))
        return EXIT_FAILURE;
    ProbeLog::enter("start");
    std::set_terminate(&tellOfException);
    qInstallMessageHandler(&handleMessage);
    QLoggingCategory::setFilterRules(QStringLiteral("kest.hmicore.debug=true"));
    AL2HMIBridge::BridgeEndpoint::setConnector([](AL2HMIBridge::BridgeEndpoint::Channel) { return -1; });
    {
        HmiApplication application(argc, argv);
        probe(&application, plugin);
        ProbeLog::enter("end");
    }
    ProbeLog::tell({{QStringLiteral("complete"), true}});
    return EXIT_SUCCESS;
}
