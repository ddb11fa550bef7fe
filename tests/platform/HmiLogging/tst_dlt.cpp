// SPDX-License-Identifier: MIT
#include <HmiLogging/HmiLoggingCategory>
#include <HmiLogging/MessageHandler>

#include <QCoreApplication>
#include <QFile>
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>

#include <sys/stat.h>

using HmiLogging::HmiLoggingCategory;
using HmiLogging::MessageHandler;

namespace {
constexpr int port = 34901;
constexpr int deadline = 8000; // ms; libdlt's own wait at the end of a process, which must not happen, takes 10 s
}

/// Log records on their way through a real daemon to a real client. The test starts itself as the process that logs.
class DltTest : public QObject
{
    Q_OBJECT

    QTemporaryDir m_folder;
    QProcess m_daemon;
    QProcess m_client;
    QByteArray m_received;

    QProcessEnvironment environment() const
    {
        QProcessEnvironment variables = QProcessEnvironment::systemEnvironment();
        variables.insert(QStringLiteral("DLT_PIPE_DIR"), m_folder.path());
        return variables;
    }

    bool receives(const QByteArray& text)
    {
        return QTest::qWaitFor(
            [&] {
                m_received += m_client.readAllStandardOutput();
                return m_received.contains(text);
            },
            deadline);
    }

    /// Standard error of a process that logs the lines of main() below; null when it did not end in time.
    QByteArray log()
    {
        QProcess process;
        process.setProcessEnvironment(environment());
        process.start(QCoreApplication::applicationFilePath(), {QStringLiteral("--emit")});
        return process.waitForFinished(deadline) && process.exitCode() == 0 ? process.readAllStandardError()
                                                                            : QByteArray();
    }

    void startDaemon()
    {
        QFile configuration(m_folder.filePath(QStringLiteral("dlt.conf")));
        QVERIFY(configuration.open(QIODevice::WriteOnly));
        configuration.write("BindAddress = ::ffff:127.0.0.1\nLoggingMode = 3\n");
        configuration.close();
        m_daemon.start(QStringLiteral("dlt-daemon"),
                       {QStringLiteral("-c"), configuration.fileName(), QStringLiteral("-t"), m_folder.path(),
                        QStringLiteral("-p"), QString::number(port)});
        QVERIFY(m_daemon.waitForStarted());
        QTRY_VERIFY(QFile::exists(m_folder.filePath(QStringLiteral("dlt"))));
        // Line by line, although it writes to a pipe.
        m_client.start(QStringLiteral("stdbuf"),
                       {QStringLiteral("-oL"), QStringLiteral("dlt-receive"), QStringLiteral("-a"),
                        QStringLiteral("-p"), QString::number(port), QStringLiteral("127.0.0.1")});
        QVERIFY(m_client.waitForStarted());
    }

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY2(!QStandardPaths::findExecutable(QStringLiteral("dlt-daemon")).isEmpty(),
                 "package dlt-daemon is missing");
        QVERIFY2(!QStandardPaths::findExecutable(QStringLiteral("dlt-receive")).isEmpty(),
                 "package dlt-tools is missing");
    }

    void withoutADaemonNothingIsDelayedAndStandardErrorStillGetsEverything()
    {
        const QByteArray output = log();
        QVERIFY2(output.contains("W test.first: one"), output.constData());
        QVERIFY(output.contains("dlt inactive"));
    }

    void aPipeThatNobodyReadsCountsAsNoDaemon()
    {
        const QByteArray pipe = QFile::encodeName(m_folder.filePath(QStringLiteral("dlt")));
        QCOMPARE(::mkfifo(pipe.constData(), 0600), 0);
        QVERIFY(log().contains("dlt inactive"));
        QFile::remove(QFile::decodeName(pipe));
    }

    void recordsReachAClientWithOneContextPerCategory()
    {
        startDaemon();
        const QByteArray output = log();
        QVERIFY2(output.contains("dlt active"), output.constData());
        QVERIFY2(receives("[one]"), m_received.constData());
        QVERIFY2(receives("[two]"), m_received.constData());
        QVERIFY2(m_received.contains("TEST C001 log warn"), m_received.constData());
        QVERIFY2(m_received.contains("TEST C002 log error"), m_received.constData());
    }

    void theDaemonsLevelBecomesTheCategorys()
    {
        QProcess process;
        process.setProcessEnvironment(environment());
        process.start(QCoreApplication::applicationFilePath(), {QStringLiteral("--wait-for-debug")});
        QVERIFY(receives("[waiting]"));
        QProcess control;
        control.start(QStringLiteral("dlt-control"),
                      {QStringLiteral("-p"), QString::number(port), QStringLiteral("-a"), QStringLiteral("WAIT"),
                       QStringLiteral("-c"), QStringLiteral("C001"), QStringLiteral("-l"), QStringLiteral("5"),
                       QStringLiteral("127.0.0.1")});
        QVERIFY(control.waitForFinished(deadline));
        QVERIFY(process.waitForFinished(deadline));
        QCOMPARE(process.exitCode(), 0);
        QVERIFY2(receives("[debug is on]"), m_received.constData());
    }

    void aDaemonThatDiesDoesNotHoldAnybodyUp()
    {
        m_daemon.kill();
        QVERIFY(m_daemon.waitForFinished());
        QVERIFY(log().contains("W test.first: one"));
    }

    void cleanupTestCase()
    {
        m_client.kill();
        m_client.waitForFinished();
        m_daemon.kill();
        m_daemon.waitForFinished();
    }
};

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    if (application.arguments().contains(QStringLiteral("--emit"))) {
        const MessageHandler handler(QStringLiteral("TEST"));
        const HmiLoggingCategory first("test.first", 1);
        const HmiLoggingCategory second("test.second", 1);
        qCWarning(first, "one");
        qCCritical(second, "two");
        qCDebug(second, "off");
        fputs(handler.dltActive() ? "dlt active\n" : "dlt inactive\n", stderr);
        return 0;
    }
    if (application.arguments().contains(QStringLiteral("--wait-for-debug"))) {
        const MessageHandler handler(QStringLiteral("WAIT"));
        const HmiLoggingCategory category("test.level", 1);
        qCWarning(category, "waiting");
        if (!QTest::qWaitFor([&] { return category.isDebugEnabled(); }, deadline))
            return 1;
        qCDebug(category, "debug is on");
        return 0;
    }
    DltTest test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_dlt.moc"
