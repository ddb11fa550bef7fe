// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "recordingwriter.h"

#include <QJsonDocument>
#include <QJsonObject>
#include <QSemaphore>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

using namespace AL2HMIBridge;

namespace {

/// A disk that takes nothing until it is allowed to, or fails.
class SlowFile : public QFile
{
public:
    SlowFile(const QString& name, QSemaphore& allowed, bool failing)
        : QFile(name)
        , m_allowed(allowed)
        , m_failing(failing)
    {
    }

protected:
    qint64 writeData(const char* data, qint64 size) override
    {
        m_allowed.acquire();
        m_allowed.release();
        return m_failing ? -1 : QFile::writeData(data, size);
    }

private:
    QSemaphore& m_allowed;
    const bool m_failing;
};

} // namespace

class RecordingWriterTest : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_directory;

    std::unique_ptr<QFile> slowFile(QSemaphore& allowed, bool failing = false) const
    {
        auto file = std::make_unique<SlowFile>(m_directory.filePath(QStringLiteral("slow.jsonl")), allowed, failing);
        if (!file->open(QIODevice::WriteOnly | QIODevice::Truncate | QIODevice::Unbuffered))
            qFatal("cannot open the file");
        return file;
    }

private Q_SLOTS:
    void whatDoesNotFitIsLeftOutAndSaid()
    {
        LogCapture log;
        QSemaphore allowed;
        const QByteArray line = "{\"x\":\"" + QByteArray(1000000, 'x') + "\"}";
        {
            RecordingWriter writer(slowFile(allowed));
            for (int i = 0; i < 20; ++i)
                writer.add(BridgeEndpoint::Messages, Direction::In, line, true);
            QCOMPARE(writer.dropped(), 12);
            allowed.release();
            QTRY_VERIFY(QFileInfo(m_directory.filePath(QStringLiteral("slow.jsonl"))).size()
                        > 8000000); // the eight that fitted
            writer.add(BridgeEndpoint::Priority, Direction::Out, "{}\n", true);
        }
        QVERIFY(log.takeOne(QtWarningMsg, QStringLiteral("The recording cannot keep up; lines are left out")));

        QFile file(m_directory.filePath(QStringLiteral("slow.jsonl")));
        QVERIFY(file.open(QIODevice::ReadOnly));
        QList<QJsonObject> lines;
        while (!file.atEnd())
            lines.append(QJsonDocument::fromJson(file.readLine()).object());
        QCOMPARE(lines.size(), 10);
        QCOMPARE(lines.at(8).value(QStringLiteral("dropped")).toInt(), 12);
        QCOMPARE(lines.at(9).value(QStringLiteral("channel")).toString(), QStringLiteral("priority"));
        QVERIFY(lines.at(9).value(QStringLiteral("line")).isObject());
    }

    void aDiskThatFailsIsReportedOnce()
    {
        LogCapture log;
        QSemaphore allowed(1);
        {
            RecordingWriter writer(slowFile(allowed, true));
            for (int i = 0; i < 5; ++i)
                writer.add(BridgeEndpoint::Messages, Direction::In, "{}", true);
        }
        const QStringList warnings = log.take(QStringLiteral("al2hmi.bridge"), QtWarningMsg);
        QCOMPARE(warnings.size(), 1);
        QVERIFY2(warnings.constFirst().startsWith(QStringLiteral("The recording ends early: ")),
                 qPrintable(warnings.constFirst()));
    }
};

QTEST_GUILESS_MAIN(RecordingWriterTest)
#include "tst_recordingwriter.moc"
