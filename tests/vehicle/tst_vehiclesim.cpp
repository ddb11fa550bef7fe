// SPDX-License-Identifier: MIT
#include <QDir>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

#include <csignal>

/// The program as a user starts it.
class VehicleSimTest : public QObject
{
    Q_OBJECT

private:
    static QString program() { return qEnvironmentVariable("VEHICLE_SIM"); }

    static bool serves(QProcess& process, const QString& directory)
    {
        process.start(program(), {QStringLiteral("--dir"), directory, QStringLiteral("--frozen")});
        return QTest::qWaitFor([&] { return process.canReadLine(); }, 20000)
               && process.readLine() == "vehicle-sim serves " + directory.toLocal8Bit() + '\n';
    }

    static bool socketsExist(const QString& directory)
    {
        return QDir(directory).entryList(QDir::System)
               == QStringList({QStringLiteral("control"), QStringLiteral("messages"), QStringLiteral("priority"),
                               QStringLiteral("touch")});
    }

private Q_SLOTS:
    void initTestCase() { QVERIFY(!program().isEmpty()); }

    void servesAndCleansUpOnItsEnd()
    {
        const QTemporaryDir directory;
        QProcess process;
        QVERIFY(serves(process, directory.path()));
        QVERIFY(socketsExist(directory.path()));
        process.terminate();
        QVERIFY(process.waitForFinished());
        QCOMPARE(process.exitStatus(), QProcess::NormalExit);
        QCOMPARE(process.exitCode(), 0);
        QVERIFY(QDir(directory.path()).entryList(QDir::System).isEmpty());
    }

    void socketsOfAKilledOneAreReplaced()
    {
        const QTemporaryDir directory;
        QProcess first;
        QVERIFY(serves(first, directory.path()));
        first.kill();
        QVERIFY(first.waitForFinished());
        QVERIFY(socketsExist(directory.path()));
        QProcess second;
        QVERIFY(serves(second, directory.path()));
        QProcess third;
        third.start(program(), {QStringLiteral("--dir"), directory.path()});
        QVERIFY(third.waitForFinished());
        QCOMPARE(third.exitCode(), 1);
        QCOMPARE(third.readAllStandardError(),
                 "vehicle-sim: " + directory.path().toLocal8Bit() + ": another vehicle serves it\n");
        QVERIFY(socketsExist(directory.path()));
        second.terminate();
        QVERIFY(second.waitForFinished());
    }

    void helpTellsTheOptions()
    {
        QProcess process;
        process.start(program(), {QStringLiteral("--help")});
        QVERIFY(process.waitForFinished());
        QCOMPARE(process.exitCode(), 0);
        const QByteArray help = process.readAllStandardOutput();
        QVERIFY(help.contains("--dir") && help.contains("--frozen"));
    }

    void unexpectedArgumentIsNamed()
    {
        QProcess process;
        process.start(program(), {QStringLiteral("fly")});
        QVERIFY(process.waitForFinished());
        QCOMPARE(process.exitCode(), 2);
        QCOMPARE(process.readAllStandardError(), QByteArray("vehicle-sim: unexpected argument: fly\n"));
    }
};

QTEST_GUILESS_MAIN(VehicleSimTest)
#include "tst_vehiclesim.moc"
