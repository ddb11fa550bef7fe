// SPDX-License-Identifier: MIT
#include "fakerecognizer.h"
#include "logcapture.h"

#include <HmiCore/DummyRecognizer>

#include <QDeadlineTimer>
#include <QDir>
#include <QMetaMethod>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>

#include <limits>
#include <optional>

#include <malloc.h>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");

int threads()
{
    return int(QDir(QStringLiteral("/proc/self/task")).entryList(QDir::Dirs | QDir::NoDotAndDotDot).size());
}

/// 0 under a sanitizer, which tells itself what is lost.
qint64 allocatedBytes()
{
    return qint64(mallinfo2().uordblks);
}

QVariant nested(int depth)
{
    QVariant list = QPointF(1, 1);
    for (int i = 0; i < depth; ++i)
        list = QVariantList{list};
    return list;
}

/// What an engine did, as told to this thread.
class Done : public QObject
{
public:
    explicit Done(const FakeRecognizer* engine)
    {
        connect(engine, &FakeRecognizer::done, this, [this](const QString& what, QThread* thread) {
            all.append(what);
            lastThread = thread;
        });
    }

    /// In order, once there are \a count.
    QStringList waitFor(int count)
    {
        [[maybe_unused]] const bool came = QTest::qWaitFor([&] { return all.size() >= count; }, 20000);
        return all;
    }

    QStringList all;
    QThread* lastThread = nullptr;
};

} // namespace

class HmiHandwritingRecognizerTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;

    static QList<QPoint> normalized(const QList<QPointF>& points, double width = 100, double height = 100)
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        engine.setInputWidth(width);
        engine.setInputHeight(height);
        return engine.normalize(stroke(points));
    }

private Q_SLOTS:
    void initTestCase() { qRegisterMetaType<QThread*>("QThread*"); }
    void init() { log.emplace(); }
    void cleanup()
    {
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        log.reset();
    }

    void theMetaObjectIsThatOfTheContract()
    {
        const QMetaObject& meta = HmiHandwritingRecognizer::staticMetaObject;
        QStringList methods;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i)
            methods.append(QString::fromLatin1(meta.method(i).methodSignature()));
        QCOMPARE(
            methods,
            QStringList({text("strokesChanged(QVariantList)"), text("candidatesChanged(QStringList)"),
                         text("candidateCountChanged(int)"), text("maxCandidateCountChanged(int)"),
                         text("inputWidthChanged(double)"), text("inputHeightChanged(double)"),
                         text("workerTriggerRecognition()"), text("workerTriggerNewStrokePreProcessing(QVariant)"),
                         text("workerTriggerProcessing()"), text("workerTriggerCandidateSelection(int)"),
                         text("setStrokes(QVariantList)"), text("setMaxCandidateCount(int)"),
                         text("setInputWidth(double)"), text("setInputHeight(double)"), text("addStrokes(QVariant)"),
                         text("selectCandidate(int)"), text("processStrokes()"), text("setCandidates(QStringList)")}));
        QCOMPARE(meta.method(meta.methodCount() - 1).access(), QMetaMethod::Protected);
        QVERIFY(!meta.property(meta.indexOfProperty("candidates")).isWritable());
    }

    void beginsWithTheDefaults()
    {
        const FakeRecognizer engine;
        QVERIFY(engine.strokes().isEmpty());
        QVERIFY(engine.candidates().isEmpty());
        QCOMPARE(engine.candidateCount(), 0);
        QCOMPARE(engine.maxCandidateCount(), 10);
        QCOMPARE(engine.inputWidth(), 100.0);
        QCOMPARE(engine.inputHeight(), 100.0);
    }

    void pointsAreCutToPercent()
    {
        QCOMPARE(normalized({{640, 480}}, 640, 480), QList<QPoint>({{100, 100}}));
        QCOMPARE(normalized({{640 * 0.999, 0}}, 640, 480), QList<QPoint>({{99, 0}}));
        QCOMPARE(normalized({{-0.5, -1.9}}), QList<QPoint>({{0, -1}}));
        QCOMPARE(normalized({{250, -250}}), QList<QPoint>({{250, -250}}));
    }

    void closePointsAreDropped()
    {
        QCOMPARE(normalized({{10, 10}, {10, 11}, {11, 11}, {12, 11}}), QList<QPoint>({{10, 10}, {11, 11}}));
        QCOMPARE(normalized({{5, 5}, {5, 5}, {5.4, 5.9}}), QList<QPoint>({{5, 5}}));
        QCOMPARE(normalized({}), QList<QPoint>());
    }

    void everyNumberHasAResult_data()
    {
        QTest::addColumn<double>("number");
        QTest::addColumn<int>("result");
        constexpr int highest = std::numeric_limits<int>::max();
        constexpr int lowest = std::numeric_limits<int>::min();
        QTest::newRow("not a number") << std::numeric_limits<double>::quiet_NaN() << 0;
        QTest::newRow("infinity") << std::numeric_limits<double>::infinity() << highest;
        QTest::newRow("minus infinity") << -std::numeric_limits<double>::infinity() << lowest;
        QTest::newRow("1e300") << 1e300 << highest;
        QTest::newRow("-1e300") << -1e300 << lowest;
        QTest::newRow("largest") << double(highest) << highest;
        QTest::newRow("smallest") << double(lowest) << lowest;
        QTest::newRow("denormal") << 5e-324 << 0;
        QTest::newRow("minus zero") << -0.0 << 0;
    }
    void everyNumberHasAResult()
    {
        QFETCH(double, number);
        QFETCH(int, result);
        QCOMPARE(normalized({{number, number}}), QList<QPoint>({{result, result}}));
        // From one end of the numbers to the other is a step as well.
        QCOMPARE(normalized({{-1e300, -1e300}, {1e300, 1e300}}).size(), 2);
    }

    void whatIsNoStrokeHasNoPoints_data()
    {
        QTest::addColumn<QVariant>("value");
        QTest::addColumn<QList<QPoint>>("points");
        const auto row = [](const char* name, const QVariant& value, const QList<QPoint>& points) {
            QTest::newRow(name) << value << points;
        };
        row("nothing", QVariant(), {});
        row("a number", 7, {});
        row("a point", QPointF(3, 4), {});
        row("a map", QVariantMap{{text("x"), 1}}, {});
        row("a text", text("1,2 3,4"), {});
        row("bytes", QByteArray("1,2"), {});
        row("an empty list", QVariantList(), {});
        row("texts", QStringList({text("1"), text("2")}), {{0, 0}});
        row("a list of what is none", QVariantList{text("no point"), QVariantList{1, 2}, QVariantMap()}, {{0, 0}});
        row("points of whole numbers among them", QVariantList{text("none"), QPoint(30, 40)}, {{0, 0}, {30, 40}});
        row("a list in a list", QVariantList{QVariantList{QPointF(30, 40), QPointF(50, 60)}}, {{0, 0}});
        row("lists in lists", nested(1000), {{0, 0}});
    }
    void whatIsNoStrokeHasNoPoints()
    {
        QFETCH(QVariant, value);
        QFETCH(QList<QPoint>, points);
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        QCOMPARE(engine.normalize(value), points);
        Done done(&engine);
        engine.addStrokes(value);
        engine.setStrokes({value, value});
        QCOMPARE(done.waitFor(2).size(), 2);
    }

    void candidatesThatThereAreNotCanBeSelected()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        Done done(&engine);
        engine.setCandidates({text("a"), text("b")});
        engine.selectCandidate(1);
        engine.setCandidates({text("c")}); // before the engine has come to it
        for (const int index : {-1, 2, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()})
            engine.selectCandidate(index);
        QCOMPARE(done.waitFor(5), QStringList({text("candidate 1"), text("candidate -1"), text("candidate 2"),
                                               text("candidate 2147483647"), text("candidate -2147483648")}));
        QCOMPARE(engine.candidates(), QStringList({text("c")}));
    }

    void emptyStrokesVanish()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        const QList<QList<QPoint>> strokes =
            engine.normalize(QList<QVariant>{stroke({{1, 1}}), stroke({}), QVariant(), stroke({{9, 9}, {50, 50}})});
        QCOMPARE(strokes, QList<QList<QPoint>>({{{1, 1}}, {{9, 9}, {50, 50}}}));
    }

    void theEngineWorksInItsOwnThread()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        Done done(&engine);
        engine.addStrokes(stroke({{1, 1}, {50, 50}}));
        engine.processStrokes();
        engine.selectCandidate(3);
        engine.setStrokes({stroke({{1, 1}}), stroke({{1, 1}, {9, 9}})});
        QCOMPARE(done.waitFor(4),
                 QStringList({text("stroke 2"), text("process"), text("candidate 3"), text("recognition 1,2")}));
        QVERIFY(done.lastThread && done.lastThread != QThread::currentThread());
        QTRY_COMPARE(engine.candidates(), QStringList({text("1"), text("2")}));
        QCOMPARE(engine.candidateCount(), 2);
    }

    void strokesThatAreEqualStartNothing()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        QSignalSpy changed(&engine, &HmiHandwritingRecognizer::strokesChanged);
        QSignalSpy triggers(&engine, &HmiHandwritingRecognizer::workerTriggerRecognition);
        engine.setStrokes({stroke({{1, 1}})});
        engine.setStrokes({stroke({{1, 1}})});
        QCOMPARE(changed.size(), 1);
        QCOMPARE(triggers.size(), 1);
        engine.setStrokes({}); // clears the result as well
        QCOMPARE(changed.size(), 2);
        QCOMPARE(triggers.size(), 2);
        engine.setStrokes({});
        QCOMPARE(triggers.size(), 2);
    }

    void anAddedStrokeIsTakenInOnly()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        QSignalSpy changed(&engine, &HmiHandwritingRecognizer::strokesChanged);
        QSignalSpy recognitions(&engine, &HmiHandwritingRecognizer::workerTriggerRecognition);
        QSignalSpy strokes(&engine, &HmiHandwritingRecognizer::workerTriggerNewStrokePreProcessing);
        engine.addStrokes(stroke({{1, 1}}));
        engine.addStrokes(stroke({{1, 1}}));
        QCOMPARE(engine.strokes().size(), 2);
        QCOMPARE(changed.size(), 2);
        QCOMPARE(changed.constLast().constFirst().toList().size(), 2);
        QCOMPARE(strokes.size(), 2);
        QCOMPARE(recognitions.size(), 0);
    }

    void limitsAndSizesRecogniseAgain()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        QSignalSpy counts(&engine, &HmiHandwritingRecognizer::maxCandidateCountChanged);
        QSignalSpy widths(&engine, &HmiHandwritingRecognizer::inputWidthChanged);
        QSignalSpy heights(&engine, &HmiHandwritingRecognizer::inputHeightChanged);
        QSignalSpy triggers(&engine, &HmiHandwritingRecognizer::workerTriggerRecognition);
        engine.setMaxCandidateCount(5);
        engine.setInputWidth(200);
        engine.setInputHeight(300);
        QCOMPARE(triggers.size(), 0); // nothing is written yet
        engine.setStrokes({stroke({{1, 1}})});
        engine.setMaxCandidateCount(6);
        engine.setInputWidth(201);
        engine.setInputHeight(301);
        QCOMPARE(triggers.size(), 4);
        for (const int count : {0, -1, 6})
            engine.setMaxCandidateCount(count);
        for (const double size : {0.0, -1.0, std::numeric_limits<double>::quiet_NaN()}) {
            engine.setInputWidth(size);
            engine.setInputHeight(size);
        }
        engine.setInputWidth(201);
        QCOMPARE(triggers.size(), 4);
        QCOMPARE(counts.size(), 2);
        QCOMPARE(widths.size(), 2);
        QCOMPARE(heights.size(), 2);
        QCOMPARE(engine.maxCandidateCount(), 6);
    }

    void candidatesAreToldOnce()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        QStringList told;
        connect(&engine, &HmiHandwritingRecognizer::candidatesChanged, &engine,
                [&](const QStringList& list) { told.append(list.join(QLatin1Char(','))); });
        connect(&engine, &HmiHandwritingRecognizer::candidateCountChanged, &engine,
                [&](int count) { told.append(QString::number(count)); });
        engine.setCandidates({text("a"), text("b")});
        engine.setCandidates({text("a"), text("b")});
        QCOMPARE(told, QStringList({text("a,b"), text("2")}));
    }

    void handlersMayAskAndChangeAgain()
    {
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        QStringList told;
        connect(&engine, &HmiHandwritingRecognizer::maxCandidateCountChanged, &engine, [&](int count) {
            told.append(QStringLiteral("%1 %2").arg(count).arg(engine.maxCandidateCount()));
            engine.setMaxCandidateCount(20);
        });
        engine.setMaxCandidateCount(5);
        QCOMPARE(told, QStringList({text("5 5"), text("20 20")}));
    }

    void theDebugLinesNameOperationAndThread()
    {
        log.emplace(text("kest.hmicore.debug=true"));
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        Done done(&engine);
        engine.addStrokes(stroke({{1, 1}}));
        engine.setInputWidth(200);
        engine.processStrokes();
        engine.selectCandidate(1);
        done.waitFor(4);
        const QStringList lines = log->take(core, QtDebugMsg);
        const char* const expected[] = {"addStrokes(const QVariant&)", "triggerNewStrokePreProcessing(const QVariant&)",
                                        "triggerRecognition()", "triggerProcessing()",
                                        "triggerCandidateSelection(int)"};
        QCOMPARE(lines.size(), 5);
        for (int i = 0; i < 5; ++i)
            QVERIFY2(lines.at(i).startsWith(QStringLiteral("void HmiCore::HmiHandwritingRecognizer::%1 Running from "
                                                           "thread: QThread(")
                                                .arg(QLatin1String(expected[i]))),
                     qPrintable(lines.at(i)));
    }

    void qmlStrokesAreOpenedInItsThread()
    {
        QQmlEngine qml;
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        Done done(&engine);
        QQmlEngine::setObjectOwnership(&engine, QQmlEngine::CppOwnership);
        qml.globalObject().setProperty(text("pad"), qml.newQObject(&engine));
        const QJSValue result =
            qml.evaluate(text("pad.addStrokes([{x: 1, y: 1}, 7]); pad.strokes = [[1], []]; pad.strokes.length"));
        QVERIFY2(!result.isError(), qPrintable(result.toString()));
        QCOMPARE(result.toInt(), 2);
        done.waitFor(2);
        const QVariantList strokes = engine.strokes();
        for (const QVariant& value : strokes)
            QVERIFY(value.userType() != qMetaTypeId<QJSValue>());
    }

    void longStrokesPass()
    {
        QVariantList points;
        for (int i = 0; i < 1000000; ++i)
            points.append(QPointF(i % 100, (i * 7) % 100));
        const Owned<FakeRecognizer> owner(new FakeRecognizer);
        FakeRecognizer& engine = *owner;
        Done done(&engine);
        engine.addStrokes(points);
        QCOMPARE(done.waitFor(1), QStringList({text("stroke 1000000")}));
        engine.setStrokes({QVariant(points)});
        QCOMPARE(done.waitFor(1).size(), 1); // the same as before
        engine.setStrokes({QVariant(points), stroke({{1, 1}})});
        QCOMPARE(done.waitFor(2).constLast(), text("recognition 1000000,1"));
    }

    void deletedWhileTheEngineWorks_data()
    {
        QTest::addColumn<int>("operation");
        QTest::newRow("stroke") << 0;
        QTest::newRow("recognition") << 1;
        QTest::newRow("process") << 2;
        QTest::newRow("candidate") << 3;
    }
    void deletedWhileTheEngineWorks()
    {
        QFETCH(int, operation);
        const int before = threads();
        const auto work = std::make_shared<Work>();
        work->waits = true;
        auto* const engine = new FakeRecognizer(work);
        const QPointer<FakeRecognizer> guard(engine);
        switch (operation) {
        case 0:
            engine->addStrokes(stroke({{1, 1}}));
            break;
        case 1:
            engine->setStrokes({stroke({{1, 1}})});
            break;
        case 2:
            engine->processStrokes();
            break;
        default:
            engine->selectCandidate(1);
        }
        QVERIFY(work->begun.tryAcquire(1, 20000));
        engine->processStrokes(); // waits behind; it is dropped
        engine->deleteLater();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete); // returns at once
        QVERIFY(guard);
        QCOMPARE(work->destroyed.load(), 0);

        work->waits = false;
        work->mayEnd.release(2);
        QTRY_VERIFY(!guard);
        QCOMPARE(work->destroyed.load(), 1);
        QTRY_VERIFY(threads() <= before); // those of earlier tests may end meanwhile
    }

    void restingRecognizersGoAtOnce()
    {
        const int before = threads();
        const QPointer<FakeRecognizer> engine(new FakeRecognizer);
        engine->deleteLater();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(!engine);
        QTRY_VERIFY(threads() <= before); // those of earlier tests may end meanwhile
    }

    /// The engine is done at any moment between the wish and its second try.
    void aDeletionThatWaitedIsNeverForgotten()
    {
        const auto work = std::make_shared<Work>();
        work->waits = true;
        for (int i = 0; i < 500; ++i) {
            const QPointer<FakeRecognizer> engine(new FakeRecognizer(work));
            engine->processStrokes();
            QVERIFY(work->begun.tryAcquire(1, 20000));
            engine->deleteLater();
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
            QMetaObject::invokeMethod(
                engine, [] {}, Qt::QueuedConnection); // with one queued, Qt drops a second wish
            work->mayEnd.release();
            const QDeadlineTimer deadline(20000);
            while (engine && !deadline.hasExpired())
                QCoreApplication::sendPostedEvents();
            QVERIFY2(!engine, qPrintable(QString::number(i)));
        }
    }

    void manyRecognizersLeaveNothingBehind()
    {
        const int before = threads();
        const auto work = std::make_shared<Work>();
        qint64 bytes = 0;
        for (int i = 0; i < 10000; ++i) {
            auto* const engine = new FakeRecognizer(work);
            if (i % 3 == 0)
                engine->addStrokes(stroke({{1, 1}, {20, 20}}));
            if (i % 2 == 0)
                engine->deleteLater();
            else
                engine->setStrokes({stroke({{1, 1}})}), engine->deleteLater();
            if (i % 50 == 0)
                QTRY_VERIFY(threads() < before + 60);
            if (i == 1000) {
                QTRY_VERIFY(threads() <= before);
                bytes = allocatedBytes();
            }
        }
        QTRY_COMPARE_WITH_TIMEOUT(work->destroyed.load(), 10000, 60000);
        QTRY_VERIFY_WITH_TIMEOUT(threads() <= before, 60000);
        const qint64 more = allocatedBytes() - bytes;
        QVERIFY2(more < 200000, qPrintable(QStringLiteral("%1 bytes more").arg(more)));
    }

    void aDummyOnlyWarns()
    {
        const Owned<DummyRecognizer> owner(new DummyRecognizer(nullptr));
        DummyRecognizer& dummy = *owner;
        dummy.addStrokes(stroke({{1, 1}}));
        dummy.setStrokes({});
        dummy.processStrokes();
        dummy.selectCandidate(0);
        QTRY_COMPARE(log->messages(core, QtWarningMsg).size(), 4);
        const QStringList warnings = log->take(core, QtWarningMsg);
        for (const QString& warning : warnings)
            QCOMPARE(warning, text("Using a dummy recognizer, don't expect much."));
        QVERIFY(dummy.candidates().isEmpty());
    }
};

QTEST_GUILESS_MAIN(HmiHandwritingRecognizerTest)
#include "tst_hmihandwritingrecognizer.moc"
