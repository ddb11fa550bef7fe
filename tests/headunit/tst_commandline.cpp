// SPDX-License-Identifier: MIT
#include "commandline.h"

#include <QTest>

class CommandLineTest : public QObject
{
    Q_OBJECT

    static CommandLine parse(const QString& arguments)
    {
        return CommandLine::parse(QStringList{QStringLiteral("headunit")}
                                  + arguments.split(QLatin1Char(' '), Qt::SkipEmptyParts));
    }

private Q_SLOTS:
    void nothingMeansRunWithTheBuiltInVehicle()
    {
        const CommandLine line = parse(QString());
        QCOMPARE(line.outcome, CommandLine::Run);
        QCOMPARE(line.size, QSize(1280, 720));
        QVERIFY(line.vehicleDirectory.isEmpty() && line.shotFile.isEmpty() && line.view.isEmpty() && !line.night);
    }

    void allOptionsAreUnderstood()
    {
        const CommandLine line = parse(
            QStringLiteral("--vehicle dir --shot f.png --view RADIO --size 800x480 --night --record r --list-views"));
        QCOMPARE(line.outcome, CommandLine::Run);
        QCOMPARE(line.vehicleDirectory, QStringLiteral("dir"));
        QCOMPARE(line.shotFile, QStringLiteral("f.png"));
        QCOMPARE(line.view, QStringLiteral("RADIO"));
        QCOMPARE(line.size, QSize(800, 480));
        QCOMPARE(line.recordFile, QStringLiteral("r"));
        QVERIFY(line.night && line.listViews);
    }

    void helpIsPrinted()
    {
        const CommandLine line = parse(QStringLiteral("--help"));
        QCOMPARE(line.outcome, CommandLine::Done);
        QVERIFY(line.message.contains(QStringLiteral("--shot")));
    }

    void mistakesAreNamed_data()
    {
        QTest::addColumn<QString>("arguments");
        QTest::addColumn<QString>("message");
        QTest::newRow("unknown option") << QStringLiteral("--nigth") << QStringLiteral("nigth");
        QTest::newRow("missing value") << QStringLiteral("--view") << QStringLiteral("view");
        QTest::newRow("positional") << QStringLiteral("radio") << QStringLiteral("Unexpected argument 'radio'.");
        QTest::newRow("size") << QStringLiteral("--size big") << QStringLiteral("'big' is not a size");
        QTest::newRow("size too small") << QStringLiteral("--size 10x10") << QStringLiteral("'10x10' is not a size");
        QTest::newRow("size too large") << QStringLiteral("--size 99999x720")
                                        << QStringLiteral("'99999x720' is not a size");
        QTest::newRow("size negative") << QStringLiteral("--size -800x480")
                                       << QStringLiteral("'-800x480' is not a size");
    }

    void mistakesAreNamed()
    {
        QFETCH(QString, arguments);
        QFETCH(QString, message);
        const CommandLine line = parse(arguments);
        QCOMPARE(line.outcome, CommandLine::Wrong);
        QVERIFY2(line.message.contains(message), qPrintable(line.message));
    }
};

QTEST_GUILESS_MAIN(CommandLineTest)
#include "tst_commandline.moc"
