// SPDX-License-Identifier: MIT
#include "handwritingenginetest.h"

#include "processuse.h"

#include <HmiCore/HmiHandwriting>

#include <QPointF>
#include <QPointer>
#include <QSignalSpy>
#include <QTest>
#include <QThread>

#include <algorithm>
#include <atomic>
#include <cmath>
#include <limits>
#include <vector>

using namespace HmiCore;

namespace {

constexpr int patience = 30000;

QVariant strokeOf(int count, QPointF (*point)(int))
{
    QVariantList stroke;
    stroke.reserve(count);
    for (int i = 0; i < count; ++i)
        stroke.append(point(i));
    return stroke;
}

QPointF zigzag(int i)
{
    return {i % 2 ? 100.0 : 0.0, double(i % 101)};
}

QPointF spiral(int i)
{
    return {50 + i / 20000.0 * std::cos(i / 1000.0), 50 + i / 20000.0 * std::sin(i / 1000.0)};
}

QPointF spot(int /*i*/)
{
    return {50, 50};
}

QVariant nested(int depth)
{
    QVariant list = QPointF(1, 1);
    for (int i = 0; i < depth; ++i)
        list = QVariantList{list};
    return list;
}

} // namespace

HandwritingEngineTest::HandwritingEngineTest(HmiHandwritingRecognizerFactory* factory, const char* recordings,
                                             const char* one, const char* other)
    : m_one(QString::fromUtf8(one))
    , m_other(QString::fromUtf8(other))
    , m_factory(factory)
    , m_file(QString::fromUtf8(recordings))
{
}

Recognizer HandwritingEngineTest::makeRecognizer() const
{
    return Recognizer(m_factory->createRecognizer(nullptr));
}

QVariantList HandwritingEngineTest::strokesOf(const QString& character) const
{
    for (const Recording& recording : m_written)
        if (recording.meant == character)
            return recording.input;
    return {};
}

bool HandwritingEngineTest::offers(const Recognizer& recognizer, const QString& character)
{
    return QTest::qWaitFor([&] { return recognizer->candidates().contains(character); }, patience);
}

bool HandwritingEngineTest::offersNothing(const Recognizer& recognizer)
{
    return QTest::qWaitFor([&] { return recognizer->candidates().isEmpty(); }, patience);
}

bool HandwritingEngineTest::answersStill(const Recognizer& recognizer) const
{
    recognizer->setInputWidth(100);
    recognizer->setInputHeight(100);
    recognizer->setStrokes({});
    if (!offersNothing(recognizer))
        return false;
    recognizer->setStrokes(strokesOf(m_one));
    return offers(recognizer, m_one);
}

void HandwritingEngineTest::initTestCase()
{
    QString error;
    m_written = Recordings::written(m_file, &error);
    QCOMPARE(error, QString());
    QVERIFY(!strokesOf(m_one).isEmpty() && !strokesOf(m_other).isEmpty());
}

void HandwritingEngineTest::init()
{
    m_log.emplace();
}

void HandwritingEngineTest::cleanup()
{
    QCOMPARE(m_log->unexpected(), QStringList());
    m_log.reset();
}

void HandwritingEngineTest::candidatesFollowEachStroke()
{
    const Recognizer recognizer = makeRecognizer();
    QStringList before;
    const QVariantList strokes = strokesOf(m_one);
    QVERIFY(strokes.size() > 1);
    for (const QVariant& stroke : strokes) {
        recognizer->addStrokes(stroke);
        QTRY_VERIFY_WITH_TIMEOUT(recognizer->candidates() != before, patience);
        before = recognizer->candidates();
    }
    QVERIFY(offers(recognizer, m_one));
    recognizer->setStrokes({});
    QVERIFY(offersNothing(recognizer));
}

void HandwritingEngineTest::offersAsManyAsWanted()
{
    const Recognizer recognizer = makeRecognizer();
    recognizer->setStrokes(strokesOf(m_one));
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->candidateCount(), 10, patience);
    recognizer->setMaxCandidateCount(3);
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->candidateCount(), 3, patience);
    recognizer->setMaxCandidateCount(std::numeric_limits<int>::max());
    QTRY_VERIFY_WITH_TIMEOUT(recognizer->candidateCount() > 10, patience);
    QStringList all = recognizer->candidates();
    QCOMPARE(all.removeDuplicates(), 0);
}

void HandwritingEngineTest::sizeOfTheWritingAreaDoesNotMatter()
{
    const Recognizer recognizer = makeRecognizer();
    recognizer->setStrokes(strokesOf(m_one));
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->candidateCount(), 10, patience);
    const QStringList expected = recognizer->candidates();
    recognizer->setStrokes({});
    QVERIFY(offersNothing(recognizer));

    recognizer->setInputWidth(640);
    recognizer->setInputHeight(640);
    QVariantList larger;
    const QVariantList strokes = strokesOf(m_one);
    for (const QVariant& stroke : strokes) {
        QVariantList points;
        const QVariantList original = stroke.toList();
        for (const QVariant& point : original)
            points.append(point.toPointF() * 6.4);
        larger.append(QVariant(points));
    }
    recognizer->setStrokes(larger);
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->candidates(), expected, patience);
}

void HandwritingEngineTest::selectionClears()
{
    const Recognizer recognizer = makeRecognizer();
    recognizer->setStrokes(strokesOf(m_one));
    QVERIFY(offers(recognizer, m_one));
    recognizer->selectCandidate(0);
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->strokes(), QVariantList(), patience);
    QVERIFY(offersNothing(recognizer));
    recognizer->setStrokes(strokesOf(m_other));
    QVERIFY(offers(recognizer, m_other));
}

void HandwritingEngineTest::selectionKeepsTheStrokesBegunSince()
{
    const Recognizer recognizer = makeRecognizer();
    recognizer->setStrokes(strokesOf(m_one));
    QVERIFY(offers(recognizer, m_one));
    recognizer->selectCandidate(0);
    const QVariantList next = strokesOf(m_other);
    while (!recognizer->candidates().isEmpty())
        QThread::yieldCurrentThread(); // without the event loop, which would clear
    for (const QVariant& stroke : next)
        recognizer->addStrokes(stroke);
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->strokes(), next, patience);
    QVERIFY(offers(recognizer, m_other));
}

void HandwritingEngineTest::selectionLeavesStrokesThatCameInsteadOfThoseSelected()
{
    const Recognizer recognizer = makeRecognizer();
    for (int round = 0; round < 20; ++round) {
        recognizer->setStrokes(strokesOf(m_one));
        QVERIFY(offers(recognizer, m_one));
        recognizer->selectCandidate(0);
        while (!recognizer->candidates().isEmpty())
            QThread::yieldCurrentThread(); // without the event loop, which would clear
        recognizer->setStrokes(strokesOf(m_other));
        QVERIFY(offers(recognizer, m_other));
        QCoreApplication::processEvents(); // now what the selection clears is there no more
        QCOMPARE(recognizer->strokes(), strokesOf(m_other));
    }
}

/// The index was for other candidates, and is one all the same: one selection, of what there is by then.
void HandwritingEngineTest::selectionAfterTheCandidatesChanged()
{
    const Recognizer recognizer = makeRecognizer();
    recognizer->setStrokes(strokesOf(m_one));
    QVERIFY(offers(recognizer, m_one));
    recognizer->setStrokes(strokesOf(m_other));
    recognizer->selectCandidate(0);
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->strokes(), QVariantList(), patience);
    QVERIFY(offersNothing(recognizer));

    recognizer->setStrokes(strokesOf(m_one));
    QVERIFY(offers(recognizer, m_one));
    recognizer->setMaxCandidateCount(2);
    recognizer->selectCandidate(5); // there are but two by then
    recognizer->setMaxCandidateCount(4);
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->candidateCount(), 4, patience);
    QCOMPARE(recognizer->strokes(), strokesOf(m_one));
}

void HandwritingEngineTest::indexesThatAreNoCandidatesAreIgnored()
{
    const Recognizer recognizer = makeRecognizer();
    recognizer->setStrokes(strokesOf(m_one));
    QVERIFY(offers(recognizer, m_one));
    QSignalSpy emptied(recognizer.get(), &HmiHandwritingRecognizer::strokesChanged);
    for (const int index : {-1, 10, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()})
        recognizer->selectCandidate(index);
    recognizer->setMaxCandidateCount(4);
    QTRY_COMPARE_WITH_TIMEOUT(recognizer->candidateCount(), 4, patience); // after the selections
    QCOMPARE(recognizer->strokes(), strokesOf(m_one));
    QCOMPARE(emptied.count(), 0);
}

void HandwritingEngineTest::nothingWrittenOffersNothing()
{
    const Recognizer recognizer = makeRecognizer();
    recognizer->processStrokes();
    recognizer->setStrokes(strokesOf(m_one));
    QVERIFY(offers(recognizer, m_one));
    recognizer->setStrokes({});
    QVERIFY(offersNothing(recognizer));
    bool offered = false;
    const QObject here; // so that the other thread only queues
    connect(recognizer.get(), &HmiHandwritingRecognizer::candidatesChanged, &here, [&offered] { offered = true; });
    recognizer->selectCandidate(0);
    recognizer->processStrokes();
    recognizer->setStrokes(strokesOf(m_other));
    QTRY_VERIFY_WITH_TIMEOUT(offered, patience);
}

void HandwritingEngineTest::oddStrokesDoNoHarm_data()
{
    QTest::addColumn<QVariantList>("strokes");
    const double huge = 1e300;
    const auto row = [](const char* name, const QVariant& stroke) { QTest::newRow(name) << QVariantList{stroke}; };
    row("an empty stroke", QVariantList());
    row("a point", QVariantList{QPointF(50, 50)});
    row("the same point again and again", strokeOf(1000, spot));
    row("a line without height", QVariantList{QPointF(10, 50), QPointF(90, 50)});
    row("a line without width", QVariantList{QPointF(50, 10), QPointF(50, 90)});
    row("a number", 7);
    row("nothing", QVariant());
    row("a text", QStringLiteral("stroke"));
    row("points that are none", QVariantList{1, QStringLiteral("2"), QVariant()});
    row("a map", QVariantMap{{QStringLiteral("x"), 1}});
    row("nested lists", QVariantList{nested(3), nested(200), QPointF(7, 7)});
    row("far outside", QVariantList{QPointF(-huge, huge), QPointF(huge, -huge), QPointF(huge, huge)});
    row("no numbers", QVariantList{QPointF(qQNaN(), 1), QPointF(qInf(), -qInf()), QPointF(5, qQNaN())});
    row("zigzag of a million points", strokeOf(1000000, zigzag));
    row("spiral of a million points", strokeOf(1000000, spiral));
    QVariantList many;
    for (int i = 0; i < 5000; ++i)
        many.append(QVariant(QVariantList{QPointF(i % 100, 10), QPointF(i % 100, 90)}));
    QTest::newRow("no strokes") << QVariantList();
    QTest::newRow("two dots") << QVariantList{QVariant(QVariantList{QPointF(50, 50)}),
                                              QVariant(QVariantList{QPointF(50, 50)})};
    QTest::newRow("64 strokes") << many.mid(0, 64);
    QTest::newRow("5000 strokes") << many;
}

void HandwritingEngineTest::oddStrokesDoNoHarm()
{
    QFETCH(QVariantList, strokes);
    const Recognizer recognizer = makeRecognizer();
    recognizer->setStrokes(strokes);
    for (const QVariant& stroke : strokes.mid(0, 3))
        recognizer->addStrokes(stroke);
    recognizer->processStrokes();
    QVERIFY(answersStill(recognizer));
}

void HandwritingEngineTest::oddSizesDoNoHarm_data()
{
    QTest::addColumn<double>("width");
    QTest::addColumn<double>("height");
    QTest::newRow("infinitely wide") << qInf() << 100.0;
    QTest::newRow("infinite") << qInf() << qInf();
    QTest::newRow("very wide") << 1e300 << 1e-300;
    QTest::newRow("very high") << 1e-300 << 1e300;
    QTest::newRow("nothing") << 0.0 << -1.0;
    QTest::newRow("no numbers") << qQNaN() << qQNaN();
    QTest::newRow("denormal") << 5e-324 << 5e-324;
}

void HandwritingEngineTest::oddSizesDoNoHarm()
{
    QFETCH(double, width);
    QFETCH(double, height);
    const Recognizer recognizer = makeRecognizer();
    recognizer->setInputWidth(width);
    recognizer->setInputHeight(height);
    recognizer->setStrokes(strokesOf(m_other));
    QVERIFY(answersStill(recognizer));
}

void HandwritingEngineTest::recognizersWorkAtTheSameTime()
{
    std::vector<Recognizer> recognizers;
    for (int i = 0; i < 6; ++i)
        recognizers.push_back(makeRecognizer());
    for (int round = 0; round < 5; ++round) {
        const QString character = round % 2 ? m_one : m_other;
        for (const Recognizer& recognizer : recognizers)
            recognizer->setStrokes(strokesOf(character));
        for (const Recognizer& recognizer : recognizers)
            QVERIFY(offers(recognizer, character));
    }
}

void HandwritingEngineTest::deletedWhileItWorks_data()
{
    QTest::addColumn<int>("operation");
    QTest::newRow("recognition") << 0;
    QTest::newRow("a stroke") << 1;
    QTest::newRow("process") << 2;
    QTest::newRow("selection") << 3;
    QTest::newRow("all") << 4;
}

void HandwritingEngineTest::deletedWhileItWorks()
{
    QFETCH(int, operation);
    QList<QPointer<HmiHandwritingRecognizer>> deleted;
    for (int i = 0; i < 50; ++i) {
        const Recognizer recognizer = makeRecognizer();
        if (operation == 0 || operation > 2)
            recognizer->setStrokes(strokesOf(m_one));
        if (operation == 1 || operation == 4)
            recognizer->addStrokes(strokesOf(m_other).constFirst());
        if (operation == 2 || operation == 4)
            recognizer->processStrokes();
        if (operation == 3 || operation == 4)
            recognizer->selectCandidate(0);
        if (i % 2)
            QThread::yieldCurrentThread();
        deleted.append(recognizer.get());
    }
    for (const auto& recognizer : std::as_const(deleted))
        QTRY_VERIFY_WITH_TIMEOUT(!recognizer, patience);
}

void HandwritingEngineTest::languageChangedWhileItWorks()
{
    HmiHandwriting::registerFactory(101, m_factory);
    HmiHandwriting::registerFactory(102, m_factory);
    HmiHandwriting handwriting;
    for (int i = 0; i < 30; ++i) {
        handwriting.setLanguage(i % 2 ? 101 : 102);
        if (i % 3)
            handwriting.recognizer()->setStrokes(strokesOf(m_one));
        else
            handwriting.recognizer()->addStrokes(strokesOf(m_other).constFirst());
    }
    QCOMPARE(handwriting.recognizer()->candidates().contains(m_one), false);
    handwriting.recognizer()->setStrokes(strokesOf(m_one));
    QTRY_VERIFY_WITH_TIMEOUT(handwriting.recognizer()->candidates().contains(m_one), patience);
}

void HandwritingEngineTest::manyRecognizersLeaveNothingBehind()
{
    const Recognizer keepsShared = makeRecognizer();
    const int threads = ProcessUse::threadCount();
    const auto run = [this](int count) {
        std::vector<QPointer<HmiHandwritingRecognizer>> made;
        for (int i = 0; i < count; ++i) {
            const Recognizer recognizer = makeRecognizer();
            recognizer->addStrokes(strokesOf(m_other).constFirst());
            made.emplace_back(recognizer.get());
        }
        const auto areGone = [&made] {
            return std::all_of(made.cbegin(), made.cend(), [](const auto& recognizer) { return !recognizer; });
        };
        QVERIFY(QTest::qWaitFor(areGone, patience));
    };
    run(50);
    QTRY_VERIFY_WITH_TIMEOUT(ProcessUse::threadCount() <= threads, patience);
    const qint64 bytes = ProcessUse::allocatedBytes();
    for (int i = 1; i < 200 && !QTest::currentTestFailed(); ++i)
        run(50);
    QTRY_VERIFY_WITH_TIMEOUT(ProcessUse::threadCount() <= threads, patience);
    QVERIFY2(QTest::qWaitFor([bytes] { return ProcessUse::allocatedBytes() < bytes + 200000; }, patience),
             qPrintable(QStringLiteral("%1 bytes more").arg(ProcessUse::allocatedBytes() - bytes)));
}

void HandwritingEngineTest::candidatesComeFromTheOwnThread()
{
    const Recognizer recognizer = makeRecognizer();
    std::atomic<QThread*> thread{nullptr};
    connect(
        recognizer.get(), &HmiHandwritingRecognizer::candidatesChanged, recognizer.get(),
        [&thread] { thread = QThread::currentThread(); }, Qt::DirectConnection);
    recognizer->setStrokes(strokesOf(m_one));
    QTRY_VERIFY_WITH_TIMEOUT(thread.load(), patience);
    QVERIFY(thread.load() != QThread::currentThread());
}
