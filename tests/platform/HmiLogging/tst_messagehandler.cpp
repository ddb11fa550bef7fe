// SPDX-License-Identifier: MIT
#include <HmiLogging/MessageHandler>

#include <QElapsedTimer>
#include <QLoggingCategory>
#include <QProcess>
#include <QRegularExpression>
#include <QTest>

using HmiLogging::MessageHandler;

class MessageHandlerTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void lineHasTimeLevelCategoryAndText_data()
    {
        QTest::addColumn<int>("type");
        QTest::addColumn<QString>("line");
        QTest::newRow("debug") << int(QtDebugMsg) << QStringLiteral("[    1.250000] D a.category: text");
        QTest::newRow("info") << int(QtInfoMsg) << QStringLiteral("[    1.250000] I a.category: text");
        QTest::newRow("warning") << int(QtWarningMsg) << QStringLiteral("[    1.250000] W a.category: text");
        QTest::newRow("critical") << int(QtCriticalMsg) << QStringLiteral("[    1.250000] C a.category: text");
        QTest::newRow("fatal") << int(QtFatalMsg) << QStringLiteral("[    1.250000] F a.category: text");
    }

    void lineHasTimeLevelCategoryAndText()
    {
        QFETCH(int, type);
        const QMessageLogContext context("file.cpp", 1, "f()", "a.category");
        QTEST(MessageHandler::format(1.25, QtMsgType(type), context, QStringLiteral("text")), "line");
    }

    void percentSignsInTheMessageAreKept()
    {
        const QMessageLogContext context("file.cpp", 1, "f()", "c");
        QCOMPARE(MessageHandler::format(0, QtDebugMsg, context, QStringLiteral("100 %2 %s")),
                 QStringLiteral("[    0.000000] D c: 100 %2 %s"));
    }

    void messagesGoToStandardErrorInOrderOfTime()
    {
        QProcess child;
        child.start(QCoreApplication::applicationFilePath(), {QStringLiteral("--emit")});
        QVERIFY(child.waitForFinished());
        const QStringList lines =
            QString::fromUtf8(child.readAllStandardError()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        QCOMPARE(lines.size(), 2);
        const QRegularExpression pattern(QStringLiteral("^\\[ *(\\d+\\.\\d{6})\\] ([WC]) default: (first|second)$"));
        const auto first = pattern.match(lines.at(0));
        const auto second = pattern.match(lines.at(1));
        QVERIFY2(first.hasMatch() && second.hasMatch(), qPrintable(lines.join(QLatin1Char('|'))));
        QCOMPARE(first.captured(3), QStringLiteral("first"));
        QVERIFY(first.captured(1).toDouble() <= second.captured(1).toDouble());
    }
};

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    if (application.arguments().contains(QStringLiteral("--emit"))) {
        const MessageHandler handler(QStringLiteral("TEST"));
        qWarning("first");
        qCritical("second");
        return 0;
    }
    MessageHandlerTest test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_messagehandler.moc"
