// SPDX-License-Identifier: MIT
#include "differences.h"
#include "logcapture.h"
#include "recording.h"
#include "replay.h"

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include <memory>
#include <sys/socket.h>
#include <unistd.h>

using namespace HmiVehicle;

/// Recorded traffic, played back as the other end.
class ReplayTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<QTemporaryDir> m_directory;

    QString write(const QByteArray& content)
    {
        QFile file(m_directory->filePath(QStringLiteral("r.jsonl")));
        return file.open(QIODevice::WriteOnly) && file.write(content) == content.size() ? file.fileName() : QString();
    }

    static QByteArray entry(double time, const char* channel, const char* direction, const QByteArray& line)
    {
        return "{\"t\":" + QByteArray::number(time) + ",\"channel\":\"" + channel + "\",\"direction\":\"" + direction
               + "\",\"line\":" + line + "}\n";
    }

    static QByteArray greeting(const char* channel)
    {
        return entry(0, channel, "in", "{\"protocol\":1,\"peer\":\"application-layer\"}");
    }

    static QByteArray call(const char* name)
    {
        return QByteArray("{\"source\":\"GlobalSource\",\"call\":\"") + name + "\",\"args\":[]}";
    }

    /// An HMI that connects, and sends a call for each line that it gets.
    int connectHmi(Replay& replay)
    {
        int pair[2];
        if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, pair) != 0)
            return -1;
        replay.addConnection(Channel::Messages, pair[0]);
        send(pair[1], "{\"protocol\":1,\"peer\":\"hmi\"}\n");
        return pair[1];
    }

    static void send(int socket, const QByteArray& bytes)
    {
        QCOMPARE(::send(socket, bytes.constData(), size_t(bytes.size()), MSG_NOSIGNAL), ssize_t(bytes.size()));
    }

    static bool receives(int socket, const QByteArray& text)
    {
        QByteArray received;
        return QTest::qWaitFor([&] {
            char buffer[4096];
            const auto count = ::recv(socket, buffer, sizeof buffer, 0);
            received.append(buffer, int(qMax<qint64>(count, 0)));
            return received.contains(text);
        });
    }

    QStringList played(Replay& replay) const
    {
        QStringList differences = replay.differences();
        for (QString& difference : differences)
            difference.remove(m_directory->path() + QLatin1Char('/'));
        return differences;
    }

    static int run(const QStringList& arguments, QByteArray* errors)
    {
        QProcess process;
        process.start(qEnvironmentVariable("VEHICLE_SIM"), arguments);
        if (!process.waitForFinished(60000))
            return -1;
        *errors = process.readAllStandardError();
        return process.exitCode();
    }

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_directory = std::make_unique<QTemporaryDir>();
    }

    void cleanup() { m_log.reset(); }

    void differencesAreFew_data()
    {
        QTest::addColumn<QByteArray>("expected");
        QTest::addColumn<QByteArray>("actual");
        QTest::addColumn<QByteArray>("differences");
        const auto row = [](const char* expected, const char* actual, const char* differences) {
            QTest::addRow("%s-%s", expected, actual)
                << QByteArray(expected) << QByteArray(actual) << QByteArray(differences);
        };
        row("", "", "");
        row("abc", "abc", "");
        row("abc", "ac", "-b ");
        row("ac", "abc", "+b ");
        row("abc", "axc", "b>x ");
        row("abcd", "axyd", "b>x c>y ");
        row("abc", "", "-a -b -c ");
        row("", "ab", "+a +b ");
        row("abcabc", "bcabca", "-a +a ");
        row("abc", "acb", "-b +b ");
        row("ab", "xayb", "+x +y ");
    }

    void differencesAreFew()
    {
        QFETCH(QByteArray, expected);
        QFETCH(QByteArray, actual);
        const auto lines = [](const QByteArray& letters) {
            std::vector<QByteArray> result;
            for (const char letter : letters)
                result.push_back(QByteArray(1, letter));
            return result;
        };
        QByteArray text;
        for (const Difference& difference : differencesOf(lines(expected), lines(actual))) {
            const bool isChange = difference.expected >= 0 && difference.actual >= 0;
            text += isChange ? "" : difference.expected >= 0 ? "-" : "+";
            if (difference.expected >= 0)
                text += expected.at(difference.expected);
            text += isChange ? ">" : "";
            if (difference.actual >= 0)
                text += actual.at(difference.actual);
            text += ' ';
        }
        QTEST(text, "differences");
    }

    void longDifferentListsAreComparedRowByRow()
    {
        std::vector<QByteArray> expected(20000, "a");
        std::vector<QByteArray> actual(20000, "b");
        expected[500] = actual[500] = "c";
        QCOMPARE(differencesOf(expected, actual).size(), size_t(19999));
    }

    void badRecordingsAreRefused_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("problem");
        QTest::newRow("empty") << QByteArray() << QStringLiteral(": nothing is recorded in it");
        QTest::newRow("garbage") << greeting("messages") + "x\n" << QStringLiteral(":2: not a line of a recording");
        QTest::newRow("channel") << entry(0, "sideways", "in", "{}") << QStringLiteral(":1: not a line of a recording");
        QTest::newRow("direction") << entry(0, "touch", "up", "{\"a\":1}")
                                   << QStringLiteral(":1: not a line of a recording");
        QTest::newRow("time") << entry(2, "touch", "in", "{\"a\":1}") + entry(1, "touch", "in", "{\"a\":1}")
                              << QStringLiteral(":2: time goes back");
    }

    void badRecordingsAreRefused()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, problem);
        Replay replay;
        const QString file = write(content);
        QVERIFY(!replay.load(file));
        QCOMPARE(replay.errorString(), file + problem);
    }

    void whatWasReceivedIsSentAndTheAnswersAreCompared()
    {
        Replay replay;
        QVERIFY(replay.load(write(greeting("messages") + entry(1, "messages", "in", "{\"first\":1}")
                                  + entry(2, "messages", "out", call("sendShortSeekUp"))
                                  + entry(3, "messages", "in", "{\"second\":2}")
                                  + entry(4, "messages", "out", call("requestBeepSound")))));
        QSignalSpy finished(&replay, &Replay::finished);
        replay.play(0);
        const int hmi = connectHmi(replay);
        QVERIFY(receives(hmi, "{\"first\":1}\n"));
        send(hmi, call("sendShortSeekUp") + '\n');
        QVERIFY(receives(hmi, "{\"second\":2}\n"));
        send(hmi, call("requestBeepSound") + '\n');
        QTRY_COMPARE(finished.size(), 1);
        QCOMPARE(finished.constFirst().constFirst().toString(), QString());
        QCOMPARE(played(replay), QStringList());
        ::close(hmi);
    }

    void missingExtraAndChangedAnswersAreTold()
    {
        Replay replay;
        QVERIFY(replay.load(write(greeting("messages") + entry(1, "messages", "out", call("sendShortSeekUp"))
                                  + entry(2, "messages", "out", call("requestBeepSound"))
                                  + entry(2, "messages", "out", call("systemVolumeSync"))
                                  + entry(3, "messages", "in", "{\"second\":2}"))));
        QSignalSpy finished(&replay, &Replay::finished);
        replay.play(0);
        const int hmi = connectHmi(replay);
        send(hmi, call("sendShortSeekDown") + '\n' + call("requestBeepSound") + '\n');
        QVERIFY(receives(hmi, "{\"second\":2}\n")); // it is not waited for for ever
        QTRY_COMPARE(finished.size(), 1);
        QCOMPARE(played(replay),
                 QStringList({QStringLiteral("r.jsonl:2: messages: expected GlobalSource.sendShortSeekUp(), came "
                                             "GlobalSource.sendShortSeekDown()"),
                              QStringLiteral("r.jsonl:4: messages: missing: GlobalSource.systemVolumeSync()")}));
        ::close(hmi);
    }

    void aLostConnectionIsLostAgain()
    {
        Replay replay;
        QVERIFY(replay.load(write(greeting("messages") + entry(1, "messages", "in", "{\"first\":1}")
                                  + greeting("messages").replace("\"t\":0", "\"t\":2")
                                  + entry(3, "messages", "in", "{\"second\":2}"))));
        QSignalSpy finished(&replay, &Replay::finished);
        replay.play(0);
        const int first = connectHmi(replay);
        QVERIFY(receives(first, "{\"first\":1}\n"));
        QVERIFY(QTest::qWaitFor([&] {
            char buffer[16];
            return ::recv(first, buffer, sizeof buffer, 0) == 0;
        }));
        const int second = connectHmi(replay);
        QVERIFY(receives(second, "{\"second\":2}\n"));
        QTRY_COMPARE(finished.size(), 1);
        ::close(first);
        ::close(second);
    }

    /// The whole circle: a scenario is played to the head unit, which records it; then the recording is played to it.
    void aRecordedSessionReplaysWithoutDifferences()
    {
        const QString directory = m_directory->filePath(QStringLiteral("bridge"));
        const QString recording = m_directory->filePath(QStringLiteral("recording.jsonl"));
        const QStringList hmi{QStringLiteral("--hmi"), qEnvironmentVariable("HEADUNIT"), QStringLiteral("--vehicle"),
                              directory};
        const QStringList sim{QStringLiteral("--dir"), directory, QStringLiteral("--speed"), QStringLiteral("0"),
                              QStringLiteral("play")};
        QByteArray errors;
        QVERIFY2(run(sim + QStringList{qEnvironmentVariable("SCENARIOS") + QStringLiteral("/seek_am.jsonl")} + hmi
                         + QStringList{QStringLiteral("--record"), recording},
                     &errors)
                     == 0,
                 errors.constData());
        QVERIFY2(run(sim + QStringList{recording} + hmi, &errors) == 0, errors.constData());

        QFile file(recording);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QByteArray content = file.readAll();
        const int where = int(content.indexOf("sendShortSeekDown"));
        QVERIFY(where > 0);
        const QByteArray line = QByteArray::number(content.left(where).count('\n') + 1);
        content.replace(where, 17, "sendLongSeekDown");
        const QString changed = write(content);
        QCOMPARE(run(sim + QStringList{changed} + hmi, &errors), 1);
        QVERIFY2(errors.contains(changed.toLocal8Bit() + ':' + line
                                 + ": messages: expected GlobalSource.sendLongSeekDown(), came "
                                   "GlobalSource.sendShortSeekDown()\n"),
                 errors.constData());
    }
};

QTEST_GUILESS_MAIN(ReplayTest)
#include "tst_replay.moc"
