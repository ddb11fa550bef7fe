// SPDX-License-Identifier: MIT
// Handwriting: what the core adds to the engines, and how long the GUI thread is kept.
#include "ratios.h"
#include "recordings.h"

#include "latinfactory.h"
#include "latinmatcher.h"
#include "zinniafactory.h"
#include "zinniamodel.h"

#include <HmiCore/HmiHandwritingRecognizer>

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QPointF>
#include <QThread>

#include <atomic>
#include <chrono>
#include <cmath>
#include <functional>
#include <memory>
#include <vector>

using namespace HmiCore;

namespace {

using Clock = std::chrono::steady_clock;

struct DeleteLater
{
    void operator()(QObject* object) const { object->deleteLater(); }
};
using Recognizer = std::unique_ptr<HmiHandwritingRecognizer, DeleteLater>;

constexpr double width = 640;
constexpr double height = 480;
constexpr int batch = 50;

double seconds(Clock::duration duration)
{
    return std::chrono::duration<double>(duration).count();
}

/// A curl, as dense as a touch screen tells it.
QVariantList curl(int points)
{
    QVariantList stroke;
    for (int i = 0; i < points; ++i)
        stroke.append(QPointF(320 + 0.2 * i * std::cos(i / 40.0), 240 + 0.2 * i * std::sin(i / 40.0)));
    return stroke;
}

/// An engine that does nothing but tell that it was asked.
class IdleRecognizer : public HmiHandwritingRecognizer
{
    Q_OBJECT

public:
    IdleRecognizer()
        : HmiHandwritingRecognizer(nullptr)
    {
    }
    void recognition(const QList<QList<QPoint>>& strokes) override { m_recognized = strokes.isEmpty(); }
    void process() override {}
    void newStrokePreProcessing(const QList<QPoint>&) override {}
    void handleCandidateSelection(int) override {}

    /// Clears the strokes, and waits until all that was asked for before is done.
    void settle()
    {
        m_recognized = false;
        setStrokes({});
        while (!m_recognized)
            QThread::yieldCurrentThread();
    }

private:
    std::atomic<bool> m_recognized{false};
};

/// The limit of normalize(): the same loop over plain points, which the variants become once.
QList<QPoint> normalizedPlainly(const QVariantList& stroke)
{
    std::vector<QPointF> points;
    points.reserve(size_t(stroke.size()));
    for (const QVariant& value : stroke)
        points.push_back(value.toPointF());
    QList<QPoint> kept;
    for (const QPointF& point : points) {
        const QPoint next(int(point.x() * 100.0 / width), int(point.y() * 100.0 / height));
        if (kept.isEmpty() || (next - kept.constLast()).manhattanLength() >= 2)
            kept.append(next);
    }
    return kept;
}

/// The limit of addStrokes(): a list in a mutex, a signal, and one into another thread.
class BareList : public QObject
{
    Q_OBJECT

public:
    explicit BareList(QThread* thread)
    {
        m_receiver.moveToThread(thread);
        connect(this, &BareList::changed, this, [](const QVariantList&) {});
        connect(this, &BareList::added, &m_receiver, [this](const QVariant&) { ++m_received; });
    }

    void add(const QVariant& stroke)
    {
        {
            const QMutexLocker locker(&m_lock);
            m_strokes.append(stroke);
        }
        Q_EMIT changed(m_strokes);
        Q_EMIT added(stroke);
    }

    void settle(int count)
    {
        while (m_received < count)
            QThread::yieldCurrentThread();
        m_received = 0;
        m_strokes.clear();
    }

Q_SIGNALS:
    void changed(const QVariantList& strokes);
    void added(const QVariant& stroke);

private:
    QMutex m_lock;
    QVariantList m_strokes;
    QObject m_receiver;
    std::atomic<int> m_received{0};
};

/// Into another thread and back.
class Hop : public QObject
{
    Q_OBJECT

public:
    explicit Hop(QThread* thread)
    {
        m_there.moveToThread(thread);
        connect(this, &Hop::go, &m_there, [this] { Q_EMIT back(); });
        connect(
            this, &Hop::back, this, [this] { m_isBack = true; }, Qt::QueuedConnection);
    }

    void run()
    {
        m_isBack = false;
        Q_EMIT go();
        while (!m_isBack)
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }

Q_SIGNALS:
    void go();
    void back();

private:
    QObject m_there;
    bool m_isBack = false;
};

template <typename Function>
void runBatches(benchmark::State& state, Function add, const std::function<void()>& settle)
{
    for (auto _ : state) {
        const auto start = Clock::now();
        for (int i = 0; i < batch; ++i)
            add();
        state.SetIterationTime(seconds(Clock::now() - start));
        settle();
    }
}

/// Waits for the candidates that \a ask leads to.
void awaitCandidates(HmiHandwritingRecognizer& recognizer, const std::function<void()>& ask)
{
    bool told = false;
    const auto connection = QObject::connect(
        &recognizer, &HmiHandwritingRecognizer::candidatesChanged, QCoreApplication::instance(),
        [&told] { told = true; }, Qt::QueuedConnection);
    ask();
    while (!told)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    QObject::disconnect(connection);
}

/// From the end of the last stroke to the candidates, in the GUI thread.
void strokeToCandidates(benchmark::State& state, HmiHandwritingRecognizer& recognizer, const QVariantList& strokes)
{
    for (auto _ : state) {
        awaitCandidates(recognizer, [&] { recognizer.setStrokes(strokes.mid(0, strokes.size() - 1)); });
        const auto start = Clock::now();
        awaitCandidates(recognizer, [&] { recognizer.addStrokes(strokes.constLast()); });
        state.SetIterationTime(seconds(Clock::now() - start));
        awaitCandidates(recognizer, [&] { recognizer.setStrokes({}); });
    }
}

QVariantList recorded(const char* file, const QString& character)
{
    QString error;
    const QList<Recording> written = Recordings::written(QString::fromUtf8(file), &error);
    for (const Recording& recording : written)
        if (recording.meant == character)
            return recording.input;
    qFatal("%s", qPrintable(error.isEmpty() ? QStringLiteral("not recorded") : error));
}

QList<QList<QPoint>> plain(const QVariantList& strokes)
{
    QList<QList<QPoint>> all;
    for (const QVariant& stroke : strokes) {
        QList<QPoint> points;
        const QVariantList values = stroke.toList();
        for (const QVariant& value : values)
            points.append(value.toPointF().toPoint());
        all.append(points);
    }
    return all;
}

QList<Latin::Stroke> inGrid(const QVariantList& strokes)
{
    QList<Latin::Stroke> all;
    const QList<QList<QPoint>> points = plain(strokes);
    for (const QList<QPoint>& stroke : points) {
        Latin::Stroke line;
        for (const QPoint& point : stroke)
            line.append(QPointF(point.x() / 65.0, (point.y() - 13) / 65.0));
        all.append(line);
    }
    return all;
}

/// The longest time that the GUI thread did not get to its events, in microseconds, in a second.
double longestGap(const std::function<void()>& eachTurn)
{
    double longest = 0;
    QElapsedTimer whole;
    whole.start();
    auto last = Clock::now();
    while (whole.elapsed() < 1000) {
        eachTurn();
        QCoreApplication::processEvents();
        const auto now = Clock::now();
        longest = std::max(longest, seconds(now - last) * 1e6);
        last = now;
        QThread::usleep(100);
    }
    return longest;
}

Samples longestGaps(const std::function<void()>& eachTurn)
{
    std::vector<double> gaps;
    for (int second = 0; second < 5; ++second)
        gaps.push_back(longestGap(eachTurn));
    return gaps;
}

Samples longestGapsWhileRecognizing(HmiHandwritingRecognizer& recognizer, const QVariantList& strokes)
{
    bool idle = true;
    const auto connection = QObject::connect(
        &recognizer, &HmiHandwritingRecognizer::candidatesChanged, QCoreApplication::instance(),
        [&idle] { idle = true; }, Qt::QueuedConnection);
    Samples gaps = longestGaps([&] {
        if (!idle)
            return;
        idle = false;
        recognizer.setStrokes(recognizer.strokes().isEmpty() ? strokes : QVariantList());
    });
    QObject::disconnect(connection);
    return gaps;
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    QThread thread;
    thread.start();

    const std::unique_ptr<IdleRecognizer, DeleteLater> idle(new IdleRecognizer);
    idle->setInputWidth(width);
    idle->setInputHeight(height);
    BareList bare(&thread);
    Hop hop(&thread);
    const QVariant shortStroke = curl(2);
    const QVariant stroke = curl(200);
    const QVariantList longStroke = curl(1000);

    Latin::LatinFactory latinFactory;
    Zinnia::ZinniaFactory zinniaFactory(QStringLiteral(ZINNIA_MODEL));
    const Recognizer latin(latinFactory.createRecognizer(nullptr));
    const Recognizer zinnia(zinniaFactory.createRecognizer(nullptr));
    const QVariantList letter = recorded(STROKES "/latin-upright.txt", QStringLiteral("k"));
    const QVariantList character = recorded(STROKES "/simplified.txt", QString::fromUtf8("国"));
    const QList<Latin::Stroke> plainLetter = inGrid(letter);
    const QList<QList<QPoint>> plainCharacter = plain(character);
    QString error;
    const auto model = Zinnia::ZinniaModel::shared(QStringLiteral(ZINNIA_MODEL), &error);

    measure("plain points", [&](benchmark::State& state) {
        for (auto _ : state)
            benchmark::DoNotOptimize(normalizedPlainly(longStroke));
    });
    measure("normalize", [&](benchmark::State& state) {
        for (auto _ : state)
            benchmark::DoNotOptimize(idle->normalize(QVariant(longStroke)));
    });
    measureManually("bare list", [&](benchmark::State& state) {
        runBatches(
            state, [&] { bare.add(stroke); }, [&] { bare.settle(batch); });
    });
    measureManually("add a stroke", [&](benchmark::State& state) {
        runBatches(
            state, [&] { idle->addStrokes(stroke); }, [&] { idle->settle(); });
    });
    measureManually("add a short stroke", [&](benchmark::State& state) {
        runBatches(
            state, [&] { idle->addStrokes(shortStroke); }, [&] { idle->settle(); });
    });
    measure("hop", [&](benchmark::State& state) {
        for (auto _ : state)
            hop.run();
    });
    measure("bare latin", [&](benchmark::State& state) {
        for (auto _ : state)
            benchmark::DoNotOptimize(Latin::Matcher::candidates(plainLetter, 10));
    });
    measureManually("latin", [&](benchmark::State& state) { strokeToCandidates(state, *latin, letter); });
    measure("bare zinnia", [&](benchmark::State& state) {
        for (auto _ : state)
            benchmark::DoNotOptimize(model->classify(plainCharacter, 10));
    });
    measureManually("zinnia", [&](benchmark::State& state) { strokeToCandidates(state, *zinnia, character); });

    Ratios ratios;
    ratios.run(argc, argv);
    ratios.row("a stroke of 1,000 points normalised / of plain points", "normalize", "plain points", 1.5);
    ratios.row("50 strokes of 200 points added / list and signals", "add a stroke", "bare list", 1.5);
    ratios.row("50 strokes of 200 points added / of 2 points", "add a stroke", "add a short stroke", 1.5);
    ratios.row("one queued hop there and back / itself", "hop", "hop");
    const double away = ratios.samples("hop").median();
    Table::row("Latin: stroke to candidates, less a hop / the engine", ratios.samples("latin").scaled(1, -away),
               ratios.samples("bare latin"), 1.5);
    Table::row("Chinese: stroke to candidates, less a hop / the engine", ratios.samples("zinnia").scaled(1, -away),
               ratios.samples("bare zinnia"), 1.5);
    const Samples frame({16000});
    Table::row("longest gap of an idle GUI thread / a frame", longestGaps([] {}), frame);
    Table::row("longest gap while Latin is recognised / a frame", longestGapsWhileRecognizing(*latin, letter), frame,
               1);
    Table::row("longest gap while Chinese is recognised / a frame", longestGapsWhileRecognizing(*zinnia, character),
               frame, 1);
    thread.quit();
    thread.wait();
}

#include "bench_handwriting.moc"
