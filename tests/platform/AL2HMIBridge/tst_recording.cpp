// SPDX-License-Identifier: MIT
#include "bridgefixture.h"

#include <AL2HMIBridge/BridgePlayer>
#include <AL2HMIBridge/BridgeRecorder>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/KeySource>

#include <QFile>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSignalSpy>

#include <sys/stat.h>

using namespace AL2HMIBridge;

class RecordingTest : public QObject
{
    Q_OBJECT

private:
    static QList<QJsonObject> readRecording(const QString& fileName)
    {
        QFile file(fileName);
        QList<QJsonObject> lines;
        if (!file.open(QIODevice::ReadOnly))
            return lines;
        while (!file.atEnd())
            lines.append(QJsonDocument::fromJson(file.readLine()).object());
        return lines;
    }

    static void write(const QString& fileName, const QByteArray& content)
    {
        QFile file(fileName);
        QVERIFY(file.open(QIODevice::WriteOnly));
        QCOMPARE(file.write(content), qint64(content.size()));
    }

private Q_SLOTS:
    void whatWasRecordedPlaysBackToTheSameState()
    {
        const QTemporaryDir directory;
        const QString fileName = directory.filePath(QStringLiteral("drive.jsonl"));
        {
            BridgeFixture bridge;
            BridgeRecorder recorder;
            QVERIFY(recorder.start(fileName));
            bridge.startMessages();
            bridge.startPriority();
            PeerSocket messages = bridge.peer.accept("messages");
            PeerSocket keys = bridge.peer.accept("priority");
            QVERIFY(messages.greetWithSnapshot("{\"source\":\"GlobalSource\",\"state\":{\"volume\":5}}\n"));
            QVERIFY(keys.greet());
            QVERIFY(messages.sendLine("garbage \"\x01"));
            QVERIFY(messages.sendLine("{\"source\":\"FMTunerSource\",\"state\":{\"stationName\":\"Größe\"}}"));
            QVERIFY(keys.sendLine("{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,3]}"));
            QSignalSpy keyEvents(KeySource::instance(), &KeySource::keyEvent);
            QTRY_COMPARE(FMTunerSource::instance()->stationName(), QStringLiteral("Größe"));
            QTRY_COMPARE(keyEvents.size(), 1);
            GlobalSource::instance()->setAudioSource(GlobalSource::AudioNext, -1);
            bridge.stop();
            recorder.stop();
            QCOMPARE(recorder.droppedLines(), 0);
            QCOMPARE(bridge.takeWarnings().size(), 1);
        }
        struct stat status
        {};
        QCOMPARE(::stat(QFile::encodeName(fileName).constData(), &status), 0);
        QCOMPARE(status.st_mode & 0777, mode_t(0600));

        const QList<QJsonObject> lines = readRecording(fileName);
        QCOMPARE(lines.size(), 8);
        double time = 0;
        for (const QJsonObject& line : lines) {
            QVERIFY(line.value(QStringLiteral("t")).toDouble() >= time);
            time = line.value(QStringLiteral("t")).toDouble();
        }
        QCOMPARE(lines.last().value(QStringLiteral("direction")).toString(), QStringLiteral("out"));
        QCOMPARE(lines.last().value(QStringLiteral("line")).toObject().value(QStringLiteral("call")).toString(),
                 QStringLiteral("setAudioSource"));

        BridgeTester::resetState();
        QCOMPARE(GlobalSource::instance()->volume(), 0);
        LogCapture log;
        BridgePlayer player;
        QSignalSpy finished(&player, &BridgePlayer::finished);
        QSignalSpy connected(BridgeConnection::instance(), &BridgeConnection::connectedChanged);
        QSignalSpy keyEvents(KeySource::instance(), &KeySource::keyEvent);
        QVERIFY(player.load(fileName));
        QVERIFY(player.play(0));
        QTRY_COMPARE(finished.size(), 1);
        QCOMPARE(GlobalSource::instance()->volume(), 5);
        QCOMPARE(FMTunerSource::instance()->stationName(), QStringLiteral("Größe"));
        QCOMPARE(keyEvents.takeFirst(), QVariantList({7, 3}));
        QCOMPARE(connected.size(), 2);                                               // it came and went
        QCOMPARE(log.take(QStringLiteral("al2hmi.bridge"), QtWarningMsg).size(), 1); // the garbage again
    }

    void paceIsThatOfTheRecordingTimesTheSpeed()
    {
        const LogCapture log;
        const QTemporaryDir directory;
        const QString fileName = directory.filePath(QStringLiteral("pace.jsonl"));
        write(
            fileName,
            "{\"t\":100.0,\"channel\":\"messages\",\"direction\":\"in\",\"line\":{\"source\":\"GlobalSource\",\"state\":{\"volume\":1}}}\n"
            "{\"t\":104.0,\"channel\":\"messages\",\"direction\":\"in\",\"line\":{\"source\":\"GlobalSource\",\"state\":{\"volume\":2}}}\n");
        BridgeTester::resetState();
        BridgePlayer player;
        QVERIFY2(player.load(fileName), qPrintable(player.errorString()));
        QElapsedTimer clock;
        QSignalSpy finished(&player, &BridgePlayer::finished);
        clock.start();
        QVERIFY(player.play(20.0));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 1);
        QTRY_COMPARE(finished.size(), 1);
        QVERIFY(clock.elapsed() >= 200); // four seconds at twenty times the speed, not sooner
        QCOMPARE(GlobalSource::instance()->volume(), 2);
    }

    void stopEndsItSilently()
    {
        const LogCapture log;
        const QTemporaryDir directory;
        const QString fileName = directory.filePath(QStringLiteral("stop.jsonl"));
        write(
            fileName,
            "{\"t\":0,\"channel\":\"messages\",\"direction\":\"in\",\"line\":{\"source\":\"GlobalSource\",\"state\":{\"volume\":1}}}\n"
            "{\"t\":1,\"channel\":\"messages\",\"direction\":\"in\",\"line\":{\"source\":\"GlobalSource\",\"state\":{\"volume\":2}}}\n");
        BridgeTester::resetState();
        BridgePlayer player;
        QVERIFY(!player.play());
        QVERIFY(player.load(fileName));
        QVERIFY(!player.play(-1));
        QSignalSpy finished(&player, &BridgePlayer::finished);
        QObject context;
        connect(GlobalSource::instance(), &GlobalSource::volumeChanged, &context, [&] { player.stop(); });
        QVERIFY(player.play(0));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 1);
        QCoreApplication::processEvents();
        QCOMPARE(GlobalSource::instance()->volume(), 1);
        QCOMPARE(finished.size(), 0);
    }

    void badRecordingIsRefusedWithFileAndLine_data()
    {
        QTest::addColumn<QByteArray>("line");
        QTest::addColumn<QString>("problem");
        const QString time = QStringLiteral("\"t\" must be a time not before the line above");
        QTest::newRow("no time") << QByteArray("{\"channel\":\"touch\",\"direction\":\"in\",\"line\":{}}") << time;
        QTest::newRow("time runs back") << QByteArray(
            "{\"t\":0.5,\"channel\":\"touch\",\"direction\":\"in\",\"line\":{}}")
                                        << time;
        QTest::newRow("channel") << QByteArray("{\"t\":2,\"channel\":\"side\",\"direction\":\"in\",\"line\":{}}")
                                 << QStringLiteral("\"channel\" must be messages, priority or touch");
        QTest::newRow("direction") << QByteArray("{\"t\":2,\"channel\":\"touch\",\"direction\":\"up\",\"line\":{}}")
                                   << QStringLiteral("\"direction\" must be in or out");
        QTest::newRow("no content") << QByteArray("{\"t\":2,\"channel\":\"touch\",\"direction\":\"in\"}")
                                    << QStringLiteral("one of \"line\", \"text\" and \"dropped\" must be there");
    }

    void badRecordingIsRefusedWithFileAndLine()
    {
        QFETCH(QByteArray, line);
        QFETCH(QString, problem);
        const QTemporaryDir directory;
        const QString fileName = directory.filePath(QStringLiteral("bad.jsonl"));
        write(fileName, "{\"t\":1,\"channel\":\"touch\",\"direction\":\"in\",\"dropped\":3}\n" + line + "\n");
        BridgePlayer player;
        QVERIFY(!player.load(fileName));
        QCOMPARE(player.errorString(), fileName + QStringLiteral(":2: ") + problem);
        QVERIFY(!player.play());
    }

    void filesThatCannotBeUsedAreNamed()
    {
        const QTemporaryDir directory;
        BridgePlayer player;
        QVERIFY(!player.load(directory.filePath(QStringLiteral("missing"))));
        QCOMPARE(player.errorString(),
                 directory.filePath(QStringLiteral("missing")) + QStringLiteral(": not a regular file"));
        BridgeRecorder recorder;
        QVERIFY(!recorder.start(directory.path()));
        QCOMPARE(recorder.errorString(), directory.path() + QStringLiteral(": not a regular file"));
        QVERIFY(!recorder.start(directory.filePath(QStringLiteral("no/such"))));
        QVERIFY(recorder.errorString().startsWith(directory.filePath(QStringLiteral("no/such: "))));
    }
};

QTEST_GUILESS_MAIN(RecordingTest)
#include "tst_recording.moc"
