// SPDX-License-Identifier: MIT
#include "startupformats.h"
#include "startupreport.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>
#include <QXmlStreamReader>

namespace {

constexpr qint64 million = 1'000'000;

QString word(const char* text)
{
    return QString::fromLatin1(text);
}

StartupTimeline example()
{
    StartupTimeline timeline;
    timeline.endPhase(word("Libraries"), 2 * million);
    timeline.endStep(word("<b>Radio</b> & more"), 5 * million);
    timeline.endStep(QString(500, QLatin1Char('m')), 6 * million);
    timeline.endPhase(word("Plugins"), 10 * million);
    return timeline;
}

/// The texts of a picture; none when it is not well formed.
QStringList texts(const QByteArray& svg)
{
    QStringList found;
    QXmlStreamReader reader(svg);
    while (!reader.atEnd())
        if (reader.readNext() == QXmlStreamReader::StartElement && reader.name() == QLatin1String("text"))
            found += reader.readElementText();
    if (reader.hasError())
        return {};
    return found;
}

QList<QJsonObject> spansOf(const QByteArray& trace)
{
    QList<QJsonObject> spans;
    const QJsonArray events = QJsonDocument::fromJson(trace).object().value(word("traceEvents")).toArray();
    for (const auto& event : events)
        if (event.toObject().value(word("ph")) == word("X"))
            spans += event.toObject();
    return spans;
}

QByteArray contentOf(const QString& name)
{
    QFile file(name);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

class StartupReportTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void phasesFollowEachOtherWithoutGaps()
    {
        const StartupTimeline timeline = example();
        QCOMPARE(timeline.duration(), 10 * million);
        QCOMPARE(timeline.spans().size(), 4);
        const qint64 expected[][2] = {{0, 2}, {2, 5}, {5, 6}, {2, 10}};
        for (int i = 0; i < 4; ++i) {
            QCOMPARE(timeline.spans()[i].begin, expected[i][0] * million);
            QCOMPARE(timeline.spans()[i].end, expected[i][1] * million);
            QCOMPARE(timeline.spans()[i].isStep, i == 1 || i == 2);
        }
    }

    void pictureShowsNamesAsPlainBoundedText()
    {
        const QStringList shown = texts(StartupFormats::picture(example()));
        QVERIFY(shown.contains(word("Libraries")));
        QVERIFY(shown.contains(word("<b>Radio</b> & more")));
        QVERIFY(shown.contains(word("8.00 ms")));
        QVERIFY(shown.indexOf(word("Plugins")) < shown.indexOf(word("<b>Radio</b> & more")));
        for (const QString& text : shown)
            QVERIFY(text.size() <= 60);
    }

    void emptyTimelineIsAPictureToo()
    {
        QCOMPARE(texts(StartupFormats::picture(StartupTimeline())).value(0),
                 word("Start of the process to the first frame: 0.0 ms"));
    }

    void traceHasACompleteEventForEachSpan()
    {
        const QList<QJsonObject> spans = spansOf(StartupFormats::trace(example()));
        QCOMPARE(spans.size(), 4);
        QCOMPARE(spans[1].value(word("name")).toString(), word("Plugins")); // around its steps
        QCOMPARE(spans[1].value(word("ts")).toDouble(), 2000.0);            // µs
        QCOMPARE(spans[1].value(word("dur")).toDouble(), 8000.0);
        QCOMPARE(spans[2].value(word("cat")).toString(), word("step"));
    }

    void tableListsEverySpan()
    {
        const QStringList lines = StartupFormats::table(example()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        QCOMPARE(lines.size(), 6);
        QCOMPARE(lines[2], word("    2.00      8.00  Plugins"));
        QCOMPARE(lines[5], word("   10.00            first frame"));
    }

    void fileThatCannotBeWrittenIsNamed()
    {
        const QTemporaryDir folder;
        QString error;
        const QString file = folder.filePath(word("nowhere/report.svg"));
        QVERIFY(!StartupReport::write(example(), file, &error));
        QVERIFY2(error.contains(file), qPrintable(error));
    }

    void headUnitTellsOfItsStart()
    {
        const QTemporaryDir folder;
        const QString file = folder.filePath(word("report.svg"));
        QProcess headUnit;
        headUnit.start(QCoreApplication::applicationDirPath() + word("/headunit"), {word("--startup-report"), file});
        QVERIFY(headUnit.waitForFinished(60000));
        const QString output = QString::fromUtf8(headUnit.readAllStandardOutput());
        const QByteArray errors = headUnit.readAllStandardError();
        QVERIFY2(headUnit.exitStatus() == QProcess::NormalExit && headUnit.exitCode() == 0, errors.constData());

        QStringList names;
        double end = 0;
        const QList<QJsonObject> spans = spansOf(contentOf(folder.filePath(word("report.json"))));
        for (const QJsonObject& span : spans) {
            names += span.value(word("name")).toString();
            const double begin = span.value(word("ts")).toDouble();
            if (span.value(word("cat")) == word("phase")) {
                QVERIFY2(qAbs(begin - end) < 0.01, qPrintable(names.constLast()));
                end = begin + span.value(word("dur")).toDouble();
            }
        }
        for (const char* const name : {"Loading libraries (CPU time)", "GUI framework", "Module plugins", "Radio",
                                       "Navigation", "State machine, window", "First view", "First frame with it"})
            QVERIFY2(names.contains(word(name)), name);
        QCOMPARE(names.size(), 25); // 17 phases, 8 modules

        const QStringList shown = texts(contentOf(file));
        for (const QString& name : std::as_const(names))
            QVERIFY2(shown.contains(name) && output.contains(name), qPrintable(name));
        QVERIFY(!errors.contains("kest.hmicore"));
    }

    void headUnitEndsWithAMessageWhenItCannotWrite()
    {
        const QTemporaryDir folder;
        QProcess headUnit;
        headUnit.start(QCoreApplication::applicationDirPath() + word("/headunit"),
                       {word("--startup-report"), folder.filePath(word("nowhere/report.svg"))});
        QVERIFY(headUnit.waitForFinished(60000));
        QCOMPARE(headUnit.exitCode(), 1);
        QVERIFY(headUnit.readAllStandardError().contains("nowhere/report.svg"));
    }
};

QTEST_GUILESS_MAIN(StartupReportTest)
#include "tst_startupreport.moc"
