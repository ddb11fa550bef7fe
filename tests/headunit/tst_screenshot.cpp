// SPDX-License-Identifier: MIT
#include <QCoreApplication>
#include <QFile>
#include <QImage>
#include <QProcess>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>

/// The program as it is called from a shell.
class ScreenshotTest : public QObject
{
    Q_OBJECT

    struct Result
    {
        int exitCode;
        QString output;
        QString errors;
    };

    static Result headunit(const QStringList& arguments)
    {
        QProcess process;
        process.start(QCoreApplication::applicationDirPath() + QStringLiteral("/headunit"), arguments);
        if (!process.waitForFinished(60000))
            return {-1, QString(), QStringLiteral("did not end")};
        return {process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -2,
                QString::fromUtf8(process.readAllStandardOutput()), QString::fromUtf8(process.readAllStandardError())};
    }

    static int colorsOf(const QImage& image)
    {
        QSet<QRgb> colors;
        for (int y = 0; y < image.height(); y += 4)
            for (int x = 0; x < image.width(); x += 4)
                colors.insert(image.pixel(x, y));
        return int(colors.size());
    }

    QTemporaryDir m_folder;

private Q_SLOTS:
    void helpNamesTheProgramAndItsOptions()
    {
        const Result help = headunit({QStringLiteral("--help")});
        QCOMPARE(help.exitCode, 0);
        QVERIFY(help.output.contains(QStringLiteral("headunit [options]")));
        QVERIFY(help.output.contains(QStringLiteral("--list-views")));
    }

    void everyViewIsDrawn_data()
    {
        QTest::addColumn<QString>("view");
        const Result list = headunit({QStringLiteral("--list-views")});
        QCOMPARE(list.exitCode, 0);
        const QStringList views = list.output.split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        QVERIFY(views.contains(QStringLiteral("SYSTEM.Launcher")));
        QVERIFY(views.contains(QStringLiteral("PHONE.IncomingCall")));
        for (const QString& view : views)
            QTest::newRow(qPrintable(view)) << view;
    }

    void everyViewIsDrawn()
    {
        QFETCH(QString, view);
        const QString file = m_folder.filePath(view + QStringLiteral(".png"));
        const Result result = headunit({QStringLiteral("--shot"), file, QStringLiteral("--view"), view});
        QVERIFY2(result.exitCode == 0, qPrintable(result.errors));
        const QImage image(file);
        QCOMPARE(image.size(), QSize(1280, 720));
        if (view == QLatin1String("SYSTEM.DisplayOff"))
            QCOMPARE(colorsOf(image), 1); // black it is
        else
            QVERIFY(colorsOf(image) > 10);
    }

    void sizeAndPaletteAreAsAsked()
    {
        const QString day = m_folder.filePath(QStringLiteral("day.png"));
        const QString night = m_folder.filePath(QStringLiteral("night.png"));
        QCOMPARE(
            headunit({QStringLiteral("--shot"), day, QStringLiteral("--size"), QStringLiteral("800x480")}).exitCode, 0);
        QCOMPARE(headunit({QStringLiteral("--shot"), night, QStringLiteral("--size"), QStringLiteral("800x480"),
                           QStringLiteral("--night")})
                     .exitCode,
                 0);
        QCOMPARE(QImage(day).size(), QSize(800, 480));
        QVERIFY(qGray(QImage(day).pixel(797, 477)) > 200);
        QVERIFY(qGray(QImage(night).pixel(797, 477)) < 40);
    }

    void theSamePictureComesEachTime()
    {
        const QString first = m_folder.filePath(QStringLiteral("first.png"));
        const QString second = m_folder.filePath(QStringLiteral("second.png"));
        QCOMPARE(headunit({QStringLiteral("--shot"), first, QStringLiteral("--view"), QStringLiteral("RADIO.Main")})
                     .exitCode,
                 0);
        QCOMPARE(headunit({QStringLiteral("--shot"), second, QStringLiteral("--view"), QStringLiteral("RADIO.Main")})
                     .exitCode,
                 0);
        QCOMPARE(QImage(first), QImage(second));
    }

    void theTrafficIsRecordedFromTheFirstLineOn()
    {
        const QString recording = m_folder.filePath(QStringLiteral("recording.jsonl"));
        QCOMPARE(headunit({QStringLiteral("--shot"), m_folder.filePath(QStringLiteral("x.png")),
                           QStringLiteral("--record"), recording})
                     .exitCode,
                 0);
        QFile file(recording);
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QByteArray lines = file.readAll();
        QVERIFY(lines.contains("\"peer\":\"application-layer\""));
        QVERIFY(lines.contains("\"snapshot\":\"complete\""));
    }

    void aRecordingIsWholeWhenTheHeadUnitIsEnded()
    {
        const QString recording = m_folder.filePath(QStringLiteral("ended.jsonl"));
        QProcess process;
        process.start(QCoreApplication::applicationDirPath() + QStringLiteral("/headunit"),
                      {QStringLiteral("--record"), recording});
        QTRY_VERIFY_WITH_TIMEOUT(QFile(recording).size() > 0, 60000);
        process.terminate();
        QVERIFY(process.waitForFinished(60000));
        QCOMPARE(process.exitStatus(), QProcess::NormalExit);
        QCOMPARE(process.exitCode(), 0);
        QFile file(recording);
        QVERIFY(file.open(QIODevice::ReadOnly));
        QVERIFY(file.readAll().endsWith("}\n"));
    }

    void mistakesEndWithAMessageAndTheirExitCode_data()
    {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<int>("exitCode");
        QTest::addColumn<QString>("message");
        QTest::newRow("unknown view") << QStringList(
            {QStringLiteral("--shot"), QStringLiteral("x.png"), QStringLiteral("--view"), QStringLiteral("Nope")})
                                      << 2 << QStringLiteral("there is no view 'Nope'; there are: APPS.Main, ");
        QTest::newRow("unknown option") << QStringList({QStringLiteral("--frobnicate")}) << 2
                                        << QStringLiteral("frobnicate");
        QTest::newRow("recording that cannot be written")
            << QStringList({QStringLiteral("--shot"), QStringLiteral("x.png"), QStringLiteral("--record"),
                            QStringLiteral("/proc/nothing/r")})
            << 1 << QStringLiteral("/proc/nothing/r");
        QTest::newRow("file that cannot be written")
            << QStringList({QStringLiteral("--shot"), QStringLiteral("/proc/nothing/x.png")}) << 1
            << QStringLiteral("'/proc/nothing/x.png' cannot be written");
    }

    void mistakesEndWithAMessageAndTheirExitCode()
    {
        QFETCH(QStringList, arguments);
        QFETCH(QString, message);
        const Result result = headunit(arguments);
        QTEST(result.exitCode, "exitCode");
        QVERIFY2(result.errors.contains(message), qPrintable(result.errors));
    }
};

QTEST_GUILESS_MAIN(ScreenshotTest)
#include "tst_screenshot.moc"
