// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

namespace {

constexpr int deadline = 120000; // ms

struct Outcome
{
    int code = -1;
    QString output;
    QString errors;

    QJsonObject json() const { return QJsonDocument::fromJson(output.toUtf8()).object(); }
    QString reason() const { return json()[QStringLiteral("reason")].toObject()[QStringLiteral("code")].toString(); }
    QString reasonText() const
    {
        return json()[QStringLiteral("reason")].toObject()[QStringLiteral("text")].toString();
    }
    QStringList texts(const char* member) const
    {
        QStringList found;
        const QJsonArray values = json()[QLatin1String(member)].toArray();
        for (const auto& value : values)
            found += value.toString();
        return found;
    }
};

Outcome check(const QStringList& arguments)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    // A sanitizer must leave signals as they are and take no leak for a fault of the plugin.
    const QString signalsAsTheyAre = QStringLiteral(":handle_segv=0:handle_sigbus=0:handle_abort=0");
    environment.insert(QStringLiteral("ASAN_OPTIONS"), QStringLiteral("detect_leaks=0") + signalsAsTheyAre);
    const QString tsanOptions = QStringLiteral("TSAN_OPTIONS");
    environment.insert(tsanOptions, environment.value(tsanOptions) + signalsAsTheyAre);
    QProcess process;
    process.setProcessEnvironment(environment);
    process.start(QStringLiteral(HMI_PLUGIN_CHECK), arguments);
    Outcome outcome;
    if (!process.waitForFinished(deadline) || process.exitStatus() != QProcess::NormalExit)
        return outcome;
    outcome.code = process.exitCode();
    outcome.output = QString::fromUtf8(process.readAllStandardOutput());
    outcome.errors = QString::fromUtf8(process.readAllStandardError());
    return outcome;
}

QString fixture(const QString& name)
{
    return QStringLiteral(FIXTURE_PLUGINS "/") + name + QStringLiteral(".so");
}

Outcome checkFixture(const QString& name, const QStringList& arguments = {})
{
    return check(arguments + QStringList{QStringLiteral("--json"), fixture(name)});
}

QByteArray contentOf(const QString& fileName)
{
    QFile file(fileName);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

bool write(const QString& fileName, const QByteArray& content)
{
    QFile file(fileName);
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

} // namespace

/// What the program says of real plugins, good ones and broken ones.
class PluginCheckTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_log = std::make_unique<LogCapture>(); }
    void cleanup()
    {
        const QStringList unexpected = m_log->unexpected();
        m_log.reset();
        QVERIFY2(unexpected.isEmpty(), qPrintable(unexpected.join(QLatin1Char('\n'))));
    }

    void unusablePlugins_data()
    {
        QTest::addColumn<QString>("headUnit");
        QTest::addColumn<QString>("reason");
        QTest::addColumn<QString>("text");
        const auto row = [](const char* plugin, const char* headUnit, const char* reason, const char* text) {
            QTest::newRow(plugin) << QString::fromLatin1(headUnit) << QString::fromLatin1(reason)
                                  << QString::fromLatin1(text);
        };
        row("truncated", "skips", "damaged", "it has 4096 bytes, its headers promise");
        row("other_iid", "skips", "unknown-interface", "\"com.kest.ivi.OtherInterface\"");
        row("case_iid", "skips", "unknown-interface", "\"com.kest.ivi.moduleinterface\"");
        row("unresolved", "skips", "missing-symbols", "nobodyHasThis");
        row("engine_unresolved", "skips", "missing-symbols", "nobodyHasThis");
        row("missing_function", "ends", "missing-symbols", "Missing::functionOfNobody(QString const&)");
        row("other_root", "skips", "other-root", "FixturePlugin");
        row("engine_other_root", "skips", "other-root", "FixturePlugin");
        row("no_keys", "skips", "no-keys", "\"Keys\"");
        row("odd_keys", "skips", "no-keys", "\"Keys\"");
        row("no_metadata", "skips", "no-keys", "\"Keys\"");
        row("engine_no_keys", "skips", "no-keys", "\"Keys\"");
        row("engine_no_metadata", "skips", "no-keys", "\"Keys\"");
        row("crash_load", "ends", "crashed", "signal 11 (Segmentation fault) while the library was loaded");
        row("crash_construct", "ends", "crashed", "in the constructor of the plugin's root object");
        row("throw_construct", "ends", "threw", "threw std::runtime_error: no fuel, in the constructor");
        row("number_construct", "ends", "threw", "threw int, in the constructor");
        row("exit_construct", "ends", "exited", "exit code 3, in the constructor");
        row("abort_create", "ends", "crashed", "signal 6 (Aborted) when it was asked for its keys");
        row("throw_create", "ends", "threw", "no fuel, when it was asked for its keys");
        row("throw_setup", "ends", "threw", "no fuel, while its modules were set up");
        row("crash_run", "ends", "crashed", "after the start");
        row("crash_end", "ends", "crashed", "at the end of the head unit");
    }

    void unusablePlugins()
    {
        QFETCH(QString, text);
        const Outcome outcome = checkFixture(QString::fromLatin1(QTest::currentDataTag()));
        QCOMPARE(outcome.code, 1);
        QCOMPARE(outcome.errors, QString());
        QCOMPARE(outcome.json()[QStringLiteral("usable")].toBool(true), false);
        QTEST(outcome.json()[QStringLiteral("headUnit")].toString(), "headUnit");
        QTEST(outcome.reason(), "reason");
        QVERIFY2(outcome.reasonText().contains(text), qPrintable(outcome.reasonText()));
    }

    void aPluginThatHangsIsGivenUp_data()
    {
        QTest::addColumn<QString>("where");
        QTest::newRow("hang_construct") << "in the constructor of the plugin's root object";
        QTest::newRow("hang_setup") << "while its modules were set up";
        QTest::newRow("hang_run") << "after the start";
    }

    void aPluginThatHangsIsGivenUp()
    {
        QFETCH(QString, where);
        const Outcome outcome = checkFixture(QString::fromLatin1(QTest::currentDataTag()),
                                             {QStringLiteral("--timeout"), QStringLiteral("6")});
        QCOMPARE(outcome.code, 1);
        QCOMPARE(outcome.json()[QStringLiteral("headUnit")].toString(), QStringLiteral("hangs"));
        QCOMPARE(outcome.reason(), QStringLiteral("hung"));
        QVERIFY2(outcome.reasonText().contains(where), qPrintable(outcome.reasonText()));
    }

    void whatIsNoPluginIsSkipped_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("reason");
        const QByteArray radio = contentOf(fixture(QStringLiteral("radio")));
        QByteArray foreign = radio;
        foreign[18] = char(40); // e_machine: ARM
        QByteArray narrow = radio;
        narrow[4] = char(3 - narrow[4]); // EI_CLASS: 64 to 32 bits, or back
        QByteArray object = radio;
        object[16] = char(1); // e_type: an object file
        QByteArray later = radio;
        const auto magic = radio.indexOf(QT_VERSION_MAJOR == 5 ? "QTMETADATA !" : "qt-project!");
        QVERIFY(magic > 0);
        const auto version = magic + 14; // the magic, format, major, minor
        later[version] = char(99);
        QTest::newRow("empty") << QByteArray() << "no-library";
        QTest::newRow("text") << QByteArray("not a plugin\n") << "no-library";
        QTest::newRow("magic only") << QByteArray("\177ELF") << "no-library";
        QTest::newRow("other processor") << foreign << "other-architecture";
        QTest::newRow("other width") << narrow << "other-architecture";
        QTest::newRow("object file") << object << "no-library";
        QTest::newRow("header only") << radio.left(64) << "damaged";
        QTest::newRow("last byte missing") << radio.left(radio.size() - 1) << "damaged";
        QByteArray homeless = radio;
        homeless.replace("libHmiCore.so.1", "libHmiC0re.so.1");
        QTest::newRow("library missing") << homeless << "not-loaded";
        QTest::newRow("later Qt") << later << "other-qt";
    }

    void whatIsNoPluginIsSkipped()
    {
        QFETCH(QByteArray, content);
        const QTemporaryDir folder;
        const QString file = folder.filePath(QStringLiteral("plugin.so"));
        QVERIFY(write(file, content));
        const Outcome outcome = check({QStringLiteral("--json"), file});
        QCOMPARE(outcome.code, 1);
        QTEST(outcome.reason(), "reason");
    }

    void aLibraryWithoutMetaDataIsNoPlugin()
    {
        const QStringList libraries = QDir(QStringLiteral(FIXTURE_PLUGINS "/../../../../src/HmiCore"))
                                          .entryList({QStringLiteral("libHmiCore.so*")});
        QVERIFY(!libraries.isEmpty());
        const Outcome outcome =
            check({QStringLiteral("--json"),
                   QStringLiteral(FIXTURE_PLUGINS "/../../../../src/HmiCore/") + libraries.first()});
        QCOMPARE(outcome.code, 1);
        QCOMPARE(outcome.reason(), QStringLiteral("no-plugin"));
    }

    void listsForbidPlugins_data()
    {
        QTest::addColumn<QByteArray>("lists");
        QTest::addColumn<int>("code");
        QTest::newRow("black") << QByteArray("[Global]\nblacklist=phone, radio\n") << 1;
        QTest::newRow("rescued") << QByteArray("[Global]\nblacklist=radio\nwhitelist=radio\n") << 0;
        QTest::newRow("another") << QByteArray("[Global]\nblacklist=phone\n") << 0;
    }

    void listsForbidPlugins()
    {
        QFETCH(QByteArray, lists);
        const QTemporaryDir folder;
        const QString file = folder.filePath(QStringLiteral("plugins.conf"));
        QVERIFY(write(file, lists));
        const Outcome outcome = checkFixture(QStringLiteral("radio"), {QStringLiteral("--lists"), file});
        QTEST(outcome.code, "code");
        QCOMPARE(outcome.reason(), outcome.code == 1 ? QStringLiteral("blacklisted") : QString());
    }

    void everyModuleOfAPluginIsDescribed()
    {
        const Outcome outcome = checkFixture(QStringLiteral("radio"));
        QCOMPARE(outcome.code, 0);
        const QJsonObject json = outcome.json();
        QCOMPARE(json[QStringLiteral("interface")].toString(), QStringLiteral("com.kest.ivi.ModuleInterface"));
        QCOMPARE(json[QStringLiteral("name")].toString(), QStringLiteral("radio"));
        QCOMPARE(outcome.texts("keys"),
                 QStringList({QStringLiteral("Radio,20,1,7,hmi"), QStringLiteral("Traffic,30,0,8,hmi")}));
        const QJsonArray modules = json[QStringLiteral("modules")].toArray();
        QCOMPARE(modules.size(), 2);
        const QJsonObject radio = modules[0].toObject();
        QCOMPARE(radio[QStringLiteral("id")].toString(), QStringLiteral("RADIO"));
        QCOMPARE(radio[QStringLiteral("kind")].toString(), QStringLiteral("menu"));
        QCOMPARE(radio[QStringLiteral("priority")].toInt(), 20);
        QCOMPARE(radio[QStringLiteral("domain")].toInt(), 7);
        QCOMPARE(radio[QStringLiteral("rootState")].toString(), QStringLiteral("RADIO.Main"));
        QCOMPARE(radio[QStringLiteral("hasRootState")].toBool(), true);
        QCOMPARE(modules[1].toObject()[QStringLiteral("kind")].toString(), QStringLiteral("background"));
    }

    void mistakesInViewsAreProblems()
    {
        const Outcome outcome = checkFixture(QStringLiteral("own_views"));
        QCOMPARE(outcome.code, 0); // the head unit lives with them
        const char* const problems[] = {
            "hmi.gui: view descriptor :/ownviews/views.json: views[3].url: the file \"Missing.qml\" does not exist",
            "hmi.gui: icon nobody-drew-this does not exist",
            "qrc:/ownviews/Faulty.qml:5:5: Buttn is not a type",
            "There is no state VIEWS.Stateless, so that the view of this name cannot be shown.",
        };
        const QStringList found = outcome.texts("problems");
        QCOMPARE(found.size(), int(std::size(problems)));
        for (int i = 0; i < found.size(); ++i)
            QCOMPARE(found.at(i), QString::fromLatin1(problems[i]));
        QCOMPARE(outcome.json()[QStringLiteral("views")].toArray().size(), 3);
        QCOMPARE(checkFixture(QStringLiteral("own_views"), {QStringLiteral("--strict")}).code, 1);
    }

    void refusedKeysAreProblemsBesideGoodOnes()
    {
        const Outcome outcome = checkFixture(QStringLiteral("null_module"));
        QCOMPARE(outcome.code, 0);
        QVERIFY(
            outcome.texts("problems").contains(QStringLiteral("Its key \"null\" is refused by the plugin itself.")));
    }

    void anEngineThatCannotBeMadeIsAProblem()
    {
        const Outcome outcome = checkFixture(QStringLiteral("latin_engine"));
        QCOMPARE(outcome.code, 0);
        const QStringList problems = outcome.texts("problems");
        QCOMPARE(problems.size(), 2);
        QVERIFY2(problems[0].startsWith(QStringLiteral("keyboard of language 3: "))
                     && problems[0].endsWith(QStringLiteral("Engine creation failed.")),
                 qPrintable(problems[0]));
        QCOMPARE(problems[1], QStringLiteral("Its key \"none\" is refused by the plugin itself."));
    }

    void pluginsOfTheHeadUnitHaveNoProblems_data()
    {
        QTest::addColumn<QString>("file");
        for (const char* const folder : {"plugins", "inputmethod-plugins"}) {
            const QDir directory(QStringLiteral(HMI_BASE_DIR "/") + QString::fromLatin1(folder));
            const QStringList files = directory.entryList(QDir::Files);
            for (const QString& file : files)
                QTest::newRow(qPrintable(file)) << directory.filePath(file);
        }
    }

    void pluginsOfTheHeadUnitHaveNoProblems()
    {
        QFETCH(QString, file);
        const Outcome outcome = check({QStringLiteral("--strict"), file});
        QVERIFY2(outcome.code == 0, qPrintable(outcome.output));
        QVERIFY(outcome.output.startsWith(QFileInfo(file).fileName() + QStringLiteral(" can be used.\n")));
    }

    void theReportForPeopleNamesTheReason()
    {
        const Outcome outcome = check({fixture(QStringLiteral("other_root"))});
        QCOMPARE(outcome.code, 1);
        QCOMPARE(outcome.output.section(QLatin1Char('\n'), 0, 1),
                 QStringLiteral("other_root.so is skipped by the head unit.\n  because      Its root object "
                                "FixturePlugin does not implement the interface of its metadata; is Q_INTERFACES "
                                "missing?"));
    }

    void wrongUsageIsRefused_data()
    {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<QString>("message");
        const auto row = [](const char* name, const QStringList& arguments, const char* message) {
            QTest::newRow(name) << arguments << QString::fromLatin1(message);
        };
        const QString radio = fixture(QStringLiteral("radio"));
        row("nothing", {}, "Name one plugin.");
        row("two", {radio, radio}, "Name one plugin.");
        row("no file", {QStringLiteral("nowhere.so")}, "There is no file 'nowhere.so'.");
        row("folder", {QStringLiteral(".")}, "'.' is not a regular file.");
        row("option", {QStringLiteral("--fast"), radio}, "Unknown option 'fast'.");
        row("lists", {QStringLiteral("--lists"), QStringLiteral("none.conf"), radio}, "There is no file 'none.conf'.");
        row("time", {QStringLiteral("--timeout"), QStringLiteral("soon"), radio},
            "--timeout needs a number of seconds from 1 to 3600, not 'soon'.");
    }

    void wrongUsageIsRefused()
    {
        QFETCH(QStringList, arguments);
        QFETCH(QString, message);
        const Outcome outcome = check(arguments);
        QCOMPARE(outcome.code, 2);
        QCOMPARE(outcome.output, QString());
        QCOMPARE(outcome.errors, QStringLiteral("hmi-plugin-check: ") + message + QLatin1Char('\n'));
    }

private:
    std::unique_ptr<LogCapture> m_log;
};

QTEST_GUILESS_MAIN(PluginCheckTest)
#include "tst_plugincheck.moc"
