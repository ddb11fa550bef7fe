// SPDX-License-Identifier: MIT
#include "command.h"
#include "logcapture.h"
#include "scenario.h"

#include <QJsonDocument>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

using namespace HmiVehicle;

/// The one grammar of command lines, scenario files and the control socket.
class CommandTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;

    static QString parse(const QString& text, Command* command)
    {
        QStringList words;
        const QString problem = Command::split(text, &words);
        return problem.isEmpty() ? Command::parse(words, command) : problem;
    }

    static Expectation expectation(const char* text)
    {
        Expectation result;
        Expectation::parse(QString::fromUtf8(text), &result);
        return result;
    }

    static QString load(Scenario& scenario, const QByteArray& content)
    {
        const QTemporaryDir directory;
        QFile file(directory.filePath(QStringLiteral("a.jsonl")));
        if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
            return QStringLiteral("cannot write");
        file.close();
        scenario.load(file.fileName());
        return scenario.errorString().remove(directory.path() + QLatin1Char('/'));
    }

private Q_SLOTS:
    void init() { m_log = std::make_unique<LogCapture>(); }
    void cleanup() { m_log.reset(); }

    void keysAreNamedOrNumbered()
    {
        Command command;
        QCOMPARE(parse(QStringLiteral("key swc_seek_up short"), &command), QString());
        QCOMPARE(command.verb, Command::ShortKey);
        QCOMPARE(command.key, 89);
        QCOMPARE(parse(QStringLiteral("key 200 long 1500"), &command), QString());
        QCOMPARE(command.verb, Command::LongKey);
        QCOMPARE(command.key, 200);
        QCOMPARE(command.number, 1500);
        QCOMPARE(parse(QStringLiteral("key 2147483647 state 77"), &command), QString());
        QCOMPARE(command.verb, Command::RawKey);
        QCOMPARE(command.number, 77);
        QCOMPARE(parse(QStringLiteral("turn tune_up -3"), &command), QString());
        QCOMPARE(command.number, -3);
        QCOMPARE(parse(QStringLiteral("combo 7"), &command), QString());
        QCOMPARE(command.number, 5);
    }

    void quotesKeepWordsTogether()
    {
        Command command;
        QCOMPARE(parse(QStringLiteral(" do  ring \"+1 555 \\\"x\" "), &command), QString());
        QCOMPARE(command.details, QStringList({QStringLiteral("+1 555 \"x")}));
        QCOMPARE(parse(QStringLiteral("do announce 'A \\ b'"), &command), QString());
        QCOMPARE(command.details, QStringList({QStringLiteral("A \\ b")}));
        QCOMPARE(parse(QStringLiteral("expect FMTunerSource.tune(\"98.5\", \"-1\")"), &command), QString());
        QCOMPARE(command.expectation.arguments, QJsonArray({QStringLiteral("98.5"), QStringLiteral("-1")}));
        QCOMPARE(parse(QStringLiteral("set FMTunerSource.radioText say \"hello\""), &command), QString());
        QCOMPARE(command.value, QJsonValue(QStringLiteral("say \"hello\"")));
        QCOMPARE(parse(QStringLiteral("set FMTunerSource.radioText \"\\u00e9\""), &command), QString());
        QCOMPARE(command.value, QJsonValue(QStringLiteral("é")));
    }

    void wrongCommandsAreExplained_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("problem");
        const auto row = [](const char* text, const char* problem) {
            QTest::newRow(text) << QString::fromUtf8(text) << QString::fromUtf8(problem);
        };
        row("", "there is no command ''");
        row("fly", "there is no command 'fly'");
        row("key", "write: key KEY short|long [MS]|state N");
        row("key 89 quickly", "a key is pressed 'short', 'long' [ms], or sent as 'state' number");
        row("key 89 short 5", "a key is pressed 'short', 'long' [ms], or sent as 'state' number");
        row("key 65536 short", "'65536' is neither the name of a key nor a number from 0 to 65535");
        row("key -1 short", "'-1' is neither the name of a key nor a number from 0 to 65535");
        row("key 2147483648 state 0", "'2147483648' is neither the name of a key nor a number from 0 to 2147483647");
        row("key horn short", "'horn' is neither the name of a key nor a number from 0 to 65535");
        row("key 89 long 0", "'0' is not a number from 1 to 86400000");
        row("turn tune_up many", "'many' is not a number from -1000 to 1000");
        row("combo 7 -1", "'-1' is not a number from 0 to 2147483647");
        row("set GlobalSource.volume 41", "GlobalSource.volume: out of range");
        row("set GlobalSource.volume 1.5", "GlobalSource.volume: not a whole number");
        row("set GlobalSource.volume loud", "GlobalSource.volume: not a whole number");
        row("set GlobalSource.volume 1,2", "GlobalSource.volume: not a whole number");
        row("set GlobalSource.muted 1", "GlobalSource.muted: neither true nor false");
        row("set GlobalSource.systemLanguage 99", "GlobalSource.systemLanguage: a number that does not exist");
        row("set GlobalSource.clockText \"far too long a text\"", "GlobalSource.clockText: too long");
        row("set FMTunerSource.presets [{}]", "FMTunerSource.presets: a record that has not all fields and no others");
        row("set GlobalSource.wings 1", "there is no state 'GlobalSource.wings'");
        row("set TunerSource.frequency 1", "there is no state 'TunerSource.frequency'");
        row("get volume", "there is no state 'volume'");
        row("do fly", "nothing called 'fly' can happen");
        row("do ring", "'do ring' takes number");
        row("do eject now", "'do eject' takes nothing more");
        row("do project far", "'far' is none of off, wired, wireless");
        row("do ring \"x", "a quote is not closed");
        row("advance -1", "'-1' is not a number from 0 to 86400000");
        row("expect GlobalSource.fly()", "there is no call GlobalSource.fly()");
        row("expect GlobalSource.setAudioSource(12)", "GlobalSource.setAudioSource() has 2 arguments, not 1");
        row("expect GlobalSource.setAudioSource(12, x)",
            "the arguments in 'GlobalSource.setAudioSource(12, x)' are not JSON values or *");
        row("expect GlobalSource.volume = 3",
            "'GlobalSource.volume = 3' is neither Source.call(…) nor Source.field == value nor none");
        row("expect GlobalSource.volume == loud", "'loud' is no value of GlobalSource.volume");
        row("expect GlobalSource.clockText < b", "only numbers can be less or greater");
        row("expect Boat.sails == true", "there is no Boat.sails");
    }

    void wrongCommandsAreExplained()
    {
        QFETCH(QString, text);
        Command command;
        QTEST(parse(text, &command), "problem");
    }

    void aStarIsAnyArgument()
    {
        const QJsonArray arguments{QStringLiteral("98.5"), QStringLiteral("*")};
        const auto matches = [&](const char* text) {
            return expectation(text).matches(QStringLiteral("FMTunerSource"), QStringLiteral("tune"), arguments);
        };
        QVERIFY(matches("FMTunerSource.tune(\"98.5\", \"*\")"));
        QVERIFY(matches("FMTunerSource.tune(*, *)"));
        QVERIFY(matches("FMTunerSource.tune(*,\"*\")"));
        QVERIFY(!matches("FMTunerSource.tune(\"*\", *)"));
        QVERIFY(!matches("AMTunerSource.tune(*, *)"));
    }

    void aStarBehindATextIsItsEnd()
    {
        const QJsonArray arguments{QStringLiteral("intent 54 ShowClimate: handled")};
        const auto matches = [&](const char* text) {
            return expectation(text).matches(QStringLiteral("DeveloperSource"), QStringLiteral("reportDecision"),
                                             arguments);
        };
        QVERIFY(matches("DeveloperSource.reportDecision(\"intent 54\"*)"));
        QVERIFY(matches("DeveloperSource.reportDecision(\"\"*)"));
        QVERIFY(!matches("DeveloperSource.reportDecision(\"intent 55\"*)"));
        QVERIFY(!matches("DeveloperSource.reportDecision(\"54\"*)"));
        QVERIFY(!matches("DeveloperSource.reportDecision(\"intent 54\")"));
    }

    void statesAreCompared()
    {
        QVERIFY(expectation("GlobalSource.volume == 12").holdsFor(12));
        QVERIFY(!expectation("GlobalSource.volume == 12").holdsFor(13));
        QVERIFY(expectation("GlobalSource.volume != 12").holdsFor(13));
        QVERIFY(expectation("GlobalSource.volume <= 12").holdsFor(12));
        QVERIFY(expectation("GlobalSource.volume < 12").holdsFor(11));
        QVERIFY(!expectation("GlobalSource.volume < 12").holdsFor(12));
        QVERIFY(expectation("GlobalSource.volume > 12").holdsFor(13));
        QVERIFY(expectation("GlobalSource.volume >= 12").holdsFor(12));
        QVERIFY(!expectation("GlobalSource.volume >= 12").holdsFor(11));
        QVERIFY(expectation("FMTunerSource.stationName == City Beat").holdsFor(QStringLiteral("City Beat")));
        QVERIFY(expectation("FMTunerSource.stationName == \"City Beat\"").holdsFor(QStringLiteral("City Beat")));
        QVERIFY(expectation("GlobalSource.muted == true").holdsFor(true));
    }

    void aScenarioIsRead()
    {
        Scenario scenario;
        QCOMPARE(load(scenario, "{\"note\": \"said\"}\n"
                                "\n"
                                "{\"key\": \"seek_up\", \"how\": \"long\", \"ms\": 900, \"note\": \"why\"}\n"
                                "{\"set\": \"FMTunerSource.radioText\", \"to\": \"1\"}\n"
                                "{\"expect\": \"FMTunerSource.tune(\\\"98.5\\\", *)\", \"within\": 20}\n"
                                "{\"do\": \"ring\", \"with\": [\"+1 555 0100\"]}\n"
                                "{\"turn\": 54, \"steps\": -2}\n"
                                "{\"forget\": true}\n"),
                 QString());
        QList<QStringList> words;
        for (const Scenario::Step& step : scenario.steps())
            words.append(step.words);
        QCOMPARE(words,
                 QList<QStringList>(
                     {{QStringLiteral("key"), QStringLiteral("seek_up"), QStringLiteral("long"), QStringLiteral("900")},
                      {QStringLiteral("set"), QStringLiteral("FMTunerSource.radioText"), QStringLiteral("\"1\"")},
                      {QStringLiteral("expect"), QStringLiteral("FMTunerSource.tune(\"98.5\", *)")},
                      {QStringLiteral("do"), QStringLiteral("ring"), QStringLiteral("+1 555 0100")},
                      {QStringLiteral("turn"), QStringLiteral("54"), QStringLiteral("-2")},
                      {QStringLiteral("forget"), QStringLiteral("true")}}));
        QVERIFY(scenario.steps().at(0).where.endsWith(QStringLiteral("a.jsonl:3")));
        QCOMPARE(scenario.steps().at(2).timeout, 20);
        QCOMPARE(scenario.steps().at(3).timeout, -1);
    }

    void aBadScenarioIsRefusedWithFileAndLine_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("problem");
        const auto row = [](const char* content, const char* problem) {
            QTest::newRow(content) << QByteArray(content) << QString::fromUtf8(problem);
        };
        row("", "a.jsonl: nothing happens in it");
        row("{\"note\":\"x\"}\n\n[]", "a.jsonl:3: not a JSON object");
        row("{\"key\":", "a.jsonl:1: unterminated object");
        row("{\"note\":1}", "a.jsonl:1: 'note' is not a text");
        row("{\"jump\":1}", "a.jsonl:1: no command in it");
        row("{\"key\":\"seek_up\"}", "a.jsonl:1: write: key KEY short|long [MS]|state N");
        row("{\"key\":\"seek_up\",\"how\":\"short\",\"to\":1}", "a.jsonl:1: 'to' does not belong to 'key'");
        row("{\"key\":\"seek_up\",\"expect\":\"none\"}", "a.jsonl:1: 'expect' and 'key' are two commands");
        row("{\"advance\":1}\n{\"expect\":\"none\",\"within\":-1}",
            "a.jsonl:2: 'within' is not a number from 0 to 3600000");
        row("{\"advance\":1,\"within\":1}", "a.jsonl:1: 'within' does not belong to 'advance'");
        row("{\"set\":\"GlobalSource.volume\",\"to\":\"12\"}", "a.jsonl:1: GlobalSource.volume: not a whole number");
    }

    void aBadScenarioIsRefusedWithFileAndLine()
    {
        QFETCH(QByteArray, content);
        Scenario scenario;
        QTEST(load(scenario, content), "problem");
    }

    void whatIsNoFileIsRefused()
    {
        Scenario scenario;
        QVERIFY(!scenario.load(QStringLiteral("/nowhere")));
        QCOMPARE(scenario.errorString(), QStringLiteral("/nowhere: there is no such file"));
        QVERIFY(!scenario.load(QDir::tempPath()));
        QVERIFY(scenario.errorString().endsWith(QStringLiteral(": not a regular file")));
    }

    void everyCommandIsExplained()
    {
        const QString usage = Command::usage();
        for (const char* const verb :
             {"key", "press", "release", "turn", "combo", "set", "get", "do", "expect", "advance", "forget"}) {
            QVERIFY(Command::isVerb(QString::fromLatin1(verb)));
            QVERIFY(usage.contains(QStringLiteral("\n  ") + QString::fromLatin1(verb))
                    || usage.startsWith(QLatin1String("  key")));
        }
        QVERIFY(!Command::isVerb(QStringLiteral("fly")));
    }
};

QTEST_GUILESS_MAIN(CommandTest)
#include "tst_command.moc"
