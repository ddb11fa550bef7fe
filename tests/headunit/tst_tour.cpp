// SPDX-License-Identifier: MIT
#include "tourfile.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

/// Tours, right and wrong; the product's own runs as a test of its own.
class TourTest : public QObject
{
    Q_OBJECT

    QString write(const QByteArray& content) const
    {
        QFile file(m_folder.filePath(QStringLiteral("tour.jsonl")));
        if (file.open(QIODevice::WriteOnly))
            file.write(content);
        return file.fileName();
    }

    struct Outcome
    {
        int exitCode;
        QString output;
        QString error;
    };

    Outcome run(const QByteArray& content, const QStringList& arguments = {}) const
    {
        QProcess headunit;
        headunit.start(QCoreApplication::applicationDirPath() + QStringLiteral("/headunit"),
                       QStringList{QStringLiteral("--tour"), write(content)} + arguments);
        const bool ended = headunit.waitForFinished(60000);
        return {ended ? headunit.exitCode() : -1, QString::fromUtf8(headunit.readAllStandardOutput()),
                QString::fromUtf8(headunit.readAllStandardError())};
    }

    const QTemporaryDir m_folder;

private Q_SLOTS:
    void wrongFilesAreNamedWithLineAndField_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("complaint");
        const auto row = [](const char* name, const char* content, const char* complaint) {
            QTest::newRow(name) << QByteArray(content) << QString::fromLatin1(complaint);
        };
        row("empty", "\n\n", "tour.jsonl: has no steps");
        row("no JSON", "{\"note\": \"x\"}\n\n{", "tour.jsonl:3: ");
        row("no step", "{\"tapp\": \"x\"}", "tour.jsonl:1: has no step");
        row("a list", "[1]", "tour.jsonl:1: has no step");
        row("unknown key", "{\"key\": \"ejector_seat\"}", "tour.jsonl:1: key: is no key of the vehicle");
        row("no field", "{\"set\": \"GlobalSource\", \"to\": 1}", "tour.jsonl:1: set: must be SOURCE.FIELD");
        row("no value", "{\"set\": \"GlobalSource.volume\"}", "tour.jsonl:1: is missing");
        row("unknown intent", "{\"intent\": \"MakeCoffee\"}", "tour.jsonl:1: intent: is no intent");
        row("no strokes", "{\"write\": []}", "tour.jsonl:1: write: must be a list of strokes");
        row("half a vehicle", "{\"vehicle\": \"half\"}", "tour.jsonl:1: vehicle: must be \"on\" or \"off\"");
        row("no text", "{\"tap\": 7}", "tour.jsonl:1: tap: must be a text");
    }
    void wrongFilesAreNamedWithLineAndField()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, complaint);
        TourFile file;
        QVERIFY(!file.load(write(content)));
        QVERIFY2(file.errorString().contains(complaint), qPrintable(file.errorString()));
    }

    void aMissingFileIsNamed()
    {
        TourFile file;
        QVERIFY(!file.load(QStringLiteral("nowhere.jsonl")));
        QVERIFY2(file.errorString().startsWith(QStringLiteral("nowhere.jsonl: ")), qPrintable(file.errorString()));
    }

    void itReadsItsNotesAndWritesItsPictures()
    {
        const QString pictures = m_folder.filePath(QStringLiteral("pictures"));
        const Outcome outcome = run("{\"note\": \"Hello.\"}\n{\"tap\": \"tileRADIO\"}\n{\"view\": \"RADIO.Main\"}\n"
                                    "{\"shot\": \"radio\"}\n{\"note\": \"Bye.\"}\n",
                                    {QStringLiteral("--pictures"), pictures});
        QVERIFY2(outcome.exitCode == 0, qPrintable(outcome.error));
        QCOMPARE(outcome.output, QStringLiteral("Hello.\nBye.\n"));
        QCOMPARE(QDir(pictures).entryList(QDir::Files), QStringList{QStringLiteral("radio.png")});
    }

    void whatDoesNotComeFailsItWithTheLineAndTheScreen()
    {
        const Outcome outcome = run("{\"tap\": \"tileRADIO\"}\n{\"item\": \"frequency\", \"shows\": \"1.0\"}\n");
        QCOMPARE(outcome.exitCode, 1);
        QVERIFY2(outcome.error.contains(QStringLiteral("tour.jsonl:2: ")), qPrintable(outcome.error));
        QVERIFY2(outcome.error.contains(QStringLiteral("the view is RADIO.Main")), qPrintable(outcome.error));
    }

    void aWrongFileStartsNothing()
    {
        QCOMPARE(run("{\"tap\": 1}").exitCode, 2);
        QCOMPARE(run("{\"note\": \"x\"}", {QStringLiteral("--vehicle"), QStringLiteral("/tmp")}).exitCode, 2);
    }
};

QTEST_GUILESS_MAIN(TourTest)
#include "tst_tour.moc"
