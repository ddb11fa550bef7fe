// SPDX-License-Identifier: MIT
#include "headunitlayout.h"

#include <HmiCore/HmiApplication>

#include <QDir>
#include <QRegularExpression>
#include <QTest>

#include <sys/stat.h>

namespace {

const QString loaded = QStringLiteral("Loaded %1 plugins");

/// What is logged when plugins are loaded, without the lines that name the directory and of what follows.
QStringList loadingLines(const HeadUnitLayout& layout)
{
    QStringList lines = layout.coreLines();
    QStringList found;
    for (int i = 1; i < lines.size(); ++i) {
        if (lines.at(i).contains(QStringLiteral("createRootState")) || lines.at(i).startsWith(QStringLiteral("W "))
            || lines.at(i).startsWith(QStringLiteral("connectTransitions")))
            break;
        found += lines.at(i);
    }
    return found;
}

QStringList texts(std::initializer_list<const char*> list)
{
    QStringList found;
    for (const char* const text : list)
        found += QString::fromUtf8(text);
    return found;
}

} // namespace

/// Plugin loading and module registration, seen from outside: real files, a real process.
class PluginLoadingTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theBaseDirectoryIsAboveBin_data()
    {
        QTest::addColumn<QString>("from");
        QTest::addColumn<QString>("to");
        QTest::newRow("bin") << "/opt/hmi/bin"
                             << "/opt/hmi";
        QTest::newRow("bin in bin") << "/opt/bin/bin"
                                    << "/opt/bin";
        QTest::newRow("base") << "/opt/hmi"
                              << "/opt/hmi";
        QTest::newRow("capital") << "/opt/hmi/Bin"
                                 << "/opt/hmi/Bin";
        QTest::newRow("capitals") << "/opt/hmi/BIN"
                                  << "/opt/hmi/BIN";
        QTest::newRow("longer name") << "/opt/hmi/bin2"
                                     << "/opt/hmi/bin2";
        QTest::newRow("bin above") << "/opt/bin/hmi"
                                   << "/opt/bin/hmi";
        QTest::newRow("root") << "/"
                              << "/";
    }

    void theBaseDirectoryIsAboveBin()
    {
        QFETCH(QString, from);
        QFETCH(QString, to);
        const QTemporaryDir root; // cdUp() goes to existing directories only
        const QString prefix = from == QStringLiteral("/") ? QString() : root.path();
        QVERIFY(QDir().mkpath(prefix + from));
        QDir dir(prefix + from);
        HmiCore::HmiApplication::moveToBaseDir(dir);
        QCOMPARE(dir.absolutePath(), QDir::cleanPath(prefix + to));
    }

    void startUpRunsInItsOrder()
    {
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("phone")});
        QVERIFY2(layout.run({QStringLiteral("rootViews")}), qPrintable(layout.error()));
        QStringList expected = texts({
            "D hmi.performance: starting receive threads",
            "D hmi.trace: starting receive threads",
            "D hmi.performance: initializing application",
            "D hmi.trace: initializing application",
            "D kest.hmicore: void HmiCore::HmiInitializer::initialize(HmiCore::HmiManager*, QQmlEngine*)",
            "D hmi.performance: pre init complete",
            "D hmi.trace: pre init complete",
            "D default: initializeSources",
            "D kest.hmicore: AL Source objects initialized.",
            "D hmi.performance: AL Source objects initialized",
            "D hmi.trace: AL Source objects initialized",
            "D kest.hmicore: Initialized qml types registered.",
            "D hmi.performance: Initialized qml types registered",
            "D hmi.trace: Initialized qml types registered",
            "D kest.hmicore: Initialized qml objects exported.",
            "D hmi.performance: Initialized qml objects exported",
            "D hmi.trace: Initialized qml objects exported",
            "D kest.hmicore: Top state tree built.",
            "D hmi.performance: Top state tree built.",
            "D hmi.trace: Top state tree built.",
            "D hmi.performance: beginning postInit",
            "D hmi.trace: beginning postInit",
            "D default: postInit",
            "D hmi.performance: finished postInit",
            "D hmi.trace: finished postInit",
            "D kest.hmicore: Framework imports path set.",
            "D kest.hmicore: Framework objects exported.",
        });
        expected += QStringLiteral("D kest.hmicore: Looking for plugins in: \"%1\"")
                        .arg(layout.path(QStringLiteral("plugins")));
        expected += texts({
            "D default: create Phone,10,1,9,hmi app",
            "D kest.hmicore: Loaded 1 plugins",
            "D default: Phone createRootState in Modules",
            "D default: Phone registerTypes",
            "D default: Phone setupRootContext",
            "D default: Phone viewDescriptorFile",
            "D default: Phone transitions",
            "D default: connectTransitions 1",
            "D default: Phone popup states",
            "D default: connectPopupStates 2",
            "D default: connectTransitions 0",
            "D default: connectPopupStates 0",
            "D default: completeInitialization",
            "D default: home PHONE.Main",
        });
        QCOMPARE(layout.lines(), expected);
    }

    void oneModulePlugin_data()
    {
        QTest::addColumn<QString>("plugin");
        QTest::addColumn<QStringList>("lines");
        const auto row = [](const char* plugin, const QStringList& lines) {
            QTest::newRow(plugin) << QString::fromLatin1(plugin) << lines;
        };
        row("radio", texts({"create Radio,20,1,7,hmi app", "create Traffic,30,0,8,hmi app", "Loaded 2 plugins"}));
        row("null_module", texts({"create null app", "Failed to create module integration for key = \"null\"",
                                  "create Kept,60,1,13,hmi app", "Loaded 1 plugins"}));
        row("no_keys", texts({"Loaded 0 plugins"}));
        row("odd_keys", texts({"Loaded 0 plugins"}));
        row("no_name", texts({"create Nameless,70,1,14,hmi app", "Loaded 1 plugins"}));
        row("no_metadata", texts({"Loaded 0 plugins"}));
        row("other_iid", texts({"\"other_iid.so\"  is not an Hmi Module Plugin. Skipping", "Loaded 0 plugins"}));
        row("case_iid", texts({"\"case_iid.so\"  is not an Hmi Module Plugin. Skipping", "Loaded 0 plugins"}));
        row("engine", texts({"\"engine.so\"  is not an Hmi Module Plugin. Skipping", "Loaded 0 plugins"}));
        row("truncated", texts({"\"truncated.so\"  is not an Hmi Module Plugin. Skipping", "Loaded 0 plugins"}));
        row("other_root", texts({"Could not obtain ModuleInterface pointer", "Loaded 0 plugins"}));
        row("unresolved", texts({"Failed to load plugin \"unresolved.so\"", "Loaded 0 plugins"}));
    }

    void oneModulePlugin()
    {
        QFETCH(QString, plugin);
        HeadUnitLayout layout;
        layout.addModules({plugin});
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QTEST(loadingLines(layout), "lines");
    }

    void oneInputMethodPlugin_data()
    {
        QTest::addColumn<QString>("plugin");
        QTest::addColumn<QStringList>("lines");
        const auto row = [](const char* plugin, const QStringList& lines) {
            QTest::newRow(plugin) << QString::fromLatin1(plugin) << lines;
        };
        row("engine", texts({"registerEngine pen app", "registerEngine keyboard app"}));
        row("refusing_engine",
            texts({"registerEngine refused app",
                   "\"refusing_engine.so\" failed to register input method engine \"refused\"",
                   "registerEngine pen app", "registerEngine refused too app",
                   "\"refusing_engine.so\" failed to register input method engine \"refused too\""}));
        row("engine_no_keys", {});
        row("engine_no_metadata",
            texts({"\"engine_no_metadata.so\"  is missing Hmi Input Method Engine Plugin metadata. Skipping"}));
        row("engine_other_root",
            texts({"Could not obtain InputMethodEngineInterface pointer \"engine_other_root.so\""}));
        row("engine_unresolved", texts({"Failed to load plugin \"engine_unresolved.so\""}));
        row("radio", texts({"\"radio.so\"  is not an Hmi Input Method Engine Plugin. Skipping"}));
        row("truncated", texts({"\"truncated.so\"  is not an Hmi Input Method Engine Plugin. Skipping"}));
    }

    void oneInputMethodPlugin()
    {
        QFETCH(QString, plugin);
        QFETCH(QStringList, lines);
        HeadUnitLayout layout;
        layout.makeDirectory(QStringLiteral("plugins"));
        layout.addEngines({plugin});
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QCOMPARE(loadingLines(layout), QStringList(QStringLiteral("Loaded 0 plugins")) + lines);
    }

    void onlyRegularFilesAreLookedAt()
    {
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("phone")});
        layout.writeFile(QStringLiteral("plugins/notes.txt"), "not a plugin\n");
        layout.writeFile(QStringLiteral("plugins/empty.so"), QByteArray());
        layout.writeFile(QStringLiteral("plugins/.hidden.so"), "hidden");
        layout.addPlugins(QStringLiteral("plugins/deeper.so"), {QStringLiteral("radio")});
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QStringList expected;
        const QStringList files = layout.filesIn(QStringLiteral("plugins"));
        QCOMPARE(files.size(), 3);
        for (const QString& file : files)
            expected += file == QStringLiteral("phone.so")
                            ? QStringLiteral("create Phone,10,1,9,hmi app")
                            : QStringLiteral("\"%1\"  is not an Hmi Module Plugin. Skipping").arg(file);
        QCOMPARE(loadingLines(layout), expected + QStringList(loaded.arg(1)));
    }

    void pluginsAreTakenInListingOrder()
    {
        HeadUnitLayout layout;
        QStringList plugins{QStringLiteral("radio"), QStringLiteral("phone"), QStringLiteral("own_kind"),
                            QStringLiteral("plainstate"), QStringLiteral("no_name")};
        layout.addModules(plugins);
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        const QHash<QString, QStringList> names{
            {QStringLiteral("radio.so"), {QStringLiteral("Radio"), QStringLiteral("Traffic")}},
            {QStringLiteral("phone.so"), {QStringLiteral("Phone")}},
            {QStringLiteral("own_kind.so"), {QStringLiteral("Kind")}},
            {QStringLiteral("plainstate.so"), {QStringLiteral("Plain")}},
            {QStringLiteral("no_name.so"), {QStringLiteral("Nameless")}},
        };
        QStringList expected;
        const QStringList files = layout.filesIn(QStringLiteral("plugins"));
        for (const QString& file : files)
            expected += names.value(file);
        QStringList created;
        QStringList registered;
        const QStringList lines = layout.coreLines();
        for (const QString& line : lines) {
            if (line.startsWith(QStringLiteral("create ")))
                created += line.section(QLatin1Char(' '), 1, 1).section(QLatin1Char(','), 0, 0);
            if (line.contains(QStringLiteral("createRootState")))
                registered += line.section(QLatin1Char(' '), 0, 0);
        }
        QCOMPARE(created, expected);
        QCOMPARE(registered, expected);
    }

    void listsChooseModulePlugins_data()
    {
        QTest::addColumn<QString>("conf");
        QTest::addColumn<QString>("names");
        QTest::newRow("no file") << QString() << "Phone Radio Traffic";
        QTest::newRow("empty file") << "\n"
                                    << "Phone Radio Traffic";
        QTest::newRow("other group") << "[Local]\nblacklist=phone\n"
                                     << "Phone Radio Traffic";
        QTest::newRow("no group") << "blacklist=phone\n"
                                  << "Phone Radio Traffic";
        QTest::newRow("blacklist") << "[Global]\nblacklist=phone\n"
                                   << "Radio Traffic";
        QTest::newRow("blacklist of two") << "[Global]\nblacklist=phone, radio\n"
                                          << "";
        QTest::newRow("both lists") << "[Global]\nwhitelist=phone\nblacklist=phone, radio\n"
                                    << "Phone";
        QTest::newRow("white list restricts nothing") << "[Global]\nwhitelist=phone\n"
                                                      << "Phone Radio Traffic";
        QTest::newRow("other case") << "[Global]\nblacklist=Phone\n"
                                    << "Phone Radio Traffic";
        QTest::newRow("part of a name") << "[Global]\nblacklist=phon, adio, phone2\n"
                                        << "Phone Radio Traffic";
        QTest::newRow("file name") << "[Global]\nblacklist=phone.so\n"
                                   << "Phone Radio Traffic";
        QTest::newRow("not INI") << "\x7f\x01{ blacklist: phone }"
                                 << "Phone Radio Traffic";
    }

    void listsChooseModulePlugins()
    {
        QFETCH(QString, conf);
        QFETCH(QString, names);
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("phone"), QStringLiteral("radio")});
        if (!conf.isEmpty())
            layout.writeFile(QStringLiteral("settings/plugins.conf"), conf.toUtf8());
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QStringList lines = loadingLines(layout);
        const QStringList expected = names.split(QLatin1Char(' '), Qt::SkipEmptyParts);
        QCOMPARE(lines.takeLast(), loaded.arg(expected.size()));
        QStringList created; // and nothing else is logged, for a plugin that is left out either
        for (const QString& line : std::as_const(lines))
            created += line.section(QLatin1Char(' '), 1).section(QLatin1Char(','), 0, 0);
        created.sort();
        QCOMPARE(created, expected);
    }

    void listsDoNotConcernInputMethods()
    {
        HeadUnitLayout layout;
        layout.makeDirectory(QStringLiteral("plugins"));
        layout.addEngines({QStringLiteral("engine_no_keys"), QStringLiteral("engine")});
        layout.writeFile(QStringLiteral("settings/plugins.conf"), "[Global]\nblacklist=engine_no_keys, \"\"\n");
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QCOMPARE(loadingLines(layout),
                 texts({"Loaded 0 plugins", "registerEngine pen app", "registerEngine keyboard app"}));
    }

    void aNamelessPluginCanBeBlacklisted()
    {
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("no_name")});
        layout.writeFile(QStringLiteral("settings/plugins.conf"), "[Global]\nblacklist=radio, \"\"\n");
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QCOMPARE(loadingLines(layout), texts({"Loaded 0 plugins"}));
    }

    void aSettingsFileThatIsAPipeIsNotRead()
    {
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("phone")});
        layout.makeDirectory(QStringLiteral("settings"));
        QCOMPARE(mkfifo(layout.path(QStringLiteral("settings/plugins.conf")).toUtf8().constData(), 0600), 0);
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QVERIFY(loadingLines(layout).contains(loaded.arg(1)));
    }

    void directoriesAreFoundFromTheProgram_data()
    {
        QTest::addColumn<QString>("programDirectory");
        QTest::addColumn<QString>("pluginDirectory"); // where the plugins are
        QTest::addColumn<QString>("searched");        // where they are looked for
        QTest::newRow("in bin") << "bin"
                                << "plugins"
                                << "plugins";
        QTest::newRow("in the base") << "."
                                     << "plugins"
                                     << "plugins";
        QTest::newRow("in Bin") << "Bin"
                                << "Bin/plugins"
                                << "Bin/plugins";
        QTest::newRow("in another directory") << "usr"
                                              << "usr/plugins"
                                              << "usr/plugins";
        QTest::newRow("no plugins directory") << "bin"
                                              << "."
                                              << ".";
        QTest::newRow("no plugins directory below Bin") << "Bin"
                                                        << "Bin"
                                                        << "Bin";
    }

    void directoriesAreFoundFromTheProgram()
    {
        QFETCH(QString, programDirectory);
        QFETCH(QString, pluginDirectory);
        QFETCH(QString, searched);
        HeadUnitLayout layout(programDirectory);
        layout.addPlugins(pluginDirectory, {QStringLiteral("phone")});
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        const QStringList lines = layout.coreLines();
        QCOMPARE(lines.first(),
                 QStringLiteral("Looking for plugins in: \"%1\"").arg(QDir::cleanPath(layout.path(searched))));
        QVERIFY(lines.contains(QStringLiteral("create Phone,10,1,9,hmi app")));
        QVERIFY(lines.contains(loaded.arg(1)));
        QVERIFY(
            !lines.join(QLatin1Char('\n')).contains(QStringLiteral("Input Method"))); // a missing directory is not told
    }

    void settingsAndInputMethodsLieInTheBaseToo()
    {
        HeadUnitLayout layout(QStringLiteral("Bin"));
        layout.addPlugins(QStringLiteral("Bin/plugins"), {QStringLiteral("phone")});
        layout.writeFile(QStringLiteral("Bin/settings/plugins.conf"), "[Global]\nblacklist=phone\n");
        layout.addPlugins(QStringLiteral("Bin/inputmethod-plugins"), {QStringLiteral("engine")});
        layout.addEngines({QStringLiteral("refusing_engine")});
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QCOMPARE(loadingLines(layout),
                 texts({"Loaded 0 plugins", "registerEngine pen app", "registerEngine keyboard app"}));
    }

    void theHomeStateIsThatOfTheSmallestPriority_data()
    {
        QTest::addColumn<QStringList>("plugins");
        QTest::addColumn<QString>("home");
        QTest::addColumn<QStringList>("warnings");
        const auto row = [](const char* name, const QStringList& plugins, const char* home,
                            const QStringList& warnings) {
            QTest::newRow(name) << plugins << QString::fromLatin1(home) << warnings;
        };
        row("smallest of three", texts({"radio", "phone"}), "PHONE.Main", {});
        row("tie", texts({"five"}), "FIRST.Main",
            texts({"W Possible module priority collision detected in  \"Second\"  priority value  5"}));
        row("tie of others", texts({"fivethreefive"}), "B.Main", {});
        row("largest priority", texts({"last"}), "",
            texts({"W Possible module priority collision detected in  \"Last\"  priority value  2147483647",
                   "W No inital state found."}));
        row("no module", {}, "", texts({"W No inital state found."}));
        row("module without a state", texts({"stateless"}), "", texts({"W No inital state found."}));
        row("only modules with a state count", texts({"stateless", "phone"}), "PHONE.Main", {});
        row("every kind counts", texts({"own_kind"}), "KIND.Main", {});
        row("a named state is enough", texts({"plainstate"}), "PLAIN.Main", {});
    }

    void theHomeStateIsThatOfTheSmallestPriority()
    {
        QFETCH(QStringList, plugins);
        QFETCH(QString, home);
        HeadUnitLayout layout;
        layout.makeDirectory(QStringLiteral("plugins"));
        layout.addModules(plugins);
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        const QStringList lines = layout.coreLines();
        QCOMPARE(lines.last().trimmed(), QStringLiteral("home %1").arg(home).trimmed());
        QTEST(lines.filter(QRegularExpression(QStringLiteral("^W "))), "warnings");
    }

    void aModuleWithoutAStateIsRegisteredAllTheSame()
    {
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("stateless")});
        QVERIFY2(layout.run(), qPrintable(layout.error()));
        QCOMPARE(layout.coreLines().filter(QStringLiteral("Stateless ")),
                 texts({"Stateless createRootState in Modules", "Stateless registerTypes", "Stateless setupRootContext",
                        "Stateless viewDescriptorFile", "Stateless transitions", "Stateless popup states"}));
    }

    void theSystemRunsAndShowsItsWindow()
    {
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("radio")});
        QVERIFY2(layout.run({QStringLiteral("run")}), qPrintable(layout.error()));
        QCOMPARE(layout.coreLines().last(), QStringLiteral("machine running, window shown"));
    }
};

QTEST_GUILESS_MAIN(PluginLoadingTest)
#include "tst_pluginloading.moc"
