// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiCore/hmicore.h>
#include <HmiLogging/HmiLoggingCategory>

#include <QQmlEngine>
#include <QTest>
#include <QThread>

using namespace HmiCore;

class HmiCoreTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theCategoryHasItsName() { QCOMPARE(hmicore().categoryName(), "kest.hmicore"); }

    void theCategoryIsOneAndTheSameInAllThreads()
    {
        QLoggingCategory* seen = nullptr;
        const std::unique_ptr<QThread> thread(QThread::create([&seen] { seen = &hmicore(); }));
        thread->start();
        QVERIFY(thread->wait());
        QCOMPARE(seen, &hmicore());
    }

    void theLevelIsThatOfThePlatformsLevelOne()
    {
        const HmiLogging::HmiLoggingCategory platform("test.level", 1);
        QCOMPARE(hmicore().isDebugEnabled(), platform.isDebugEnabled());
        QCOMPARE(hmicore().isWarningEnabled(), platform.isWarningEnabled());
    }

    void nativeLinesJoinItemsWithBlanksAndQuoteStrings()
    {
        LogCapture log(QStringLiteral("kest.hmicore.debug=true"));
        const auto core = []() -> const QLoggingCategory& { return hmicore(); };
        qCDebug(core) << "literal" << QStringLiteral("string") << 7;
        const QList<LogCapture::Record> records = log.records();
        QCOMPARE(records.size(), 1);
        QCOMPARE(records.first().message, QStringLiteral("literal \"string\" 7"));
        QCOMPARE(records.first().category, QStringLiteral("kest.hmicore"));
        QVERIFY(records.first().file.endsWith(QStringLiteral("tst_hmicore.cpp")));
        QVERIFY(records.first().line > 0);
        QVERIFY(records.first().function.contains(QStringLiteral("nativeLinesJoinItems")));
    }

    void qmlLoggersOfTheLibraryWork()
    {
        LogCapture log(QStringLiteral("hmi.trace.debug=true"));
        QQmlEngine engine;
        installCustomLogObjects(&engine);
        engine.evaluate(QStringLiteral("traceLogger.debug('here', [1, 2])"), QStringLiteral("caller.js"), 5);
        const QList<LogCapture::Record> records = log.records();
        QCOMPARE(records.size(), 1);
        QCOMPARE(records.first().message, QStringLiteral("here [1,2]"));
        QCOMPARE(records.first().line, 5);
        QVERIFY(records.first().file.endsWith(QStringLiteral("caller.js")));
    }
};

QTEST_GUILESS_MAIN(HmiCoreTest)
#include "tst_hmicore.moc"
