// SPDX-License-Identifier: MIT
#include "hmihandwritingrecognizer.h"

#include "hmihandwritingrecognizerworker.h"
#include "logcategories.h"

#include <QEvent>
#include <QJSValue>
#include <QMutexLocker>
#include <QPointF>
#include <QThread>

#include <cmath>
#include <limits>

namespace HmiCore {

namespace {

constexpr int shortestStep = 2;

template <typename Value>
Value locked(QMutex& lock, const Value& value)
{
    const QMutexLocker locker(&lock);
    return value;
}

/// False, and nothing is stored, when the value is the same already.
template <typename Value>
bool store(QMutex& lock, Value& member, const Value& value)
{
    const QMutexLocker locker(&lock);
    if (member == value)
        return false;
    member = value;
    return true;
}

/// QML's own values are opened here, in the thread of its engine, and not by the worker.
QVariant plain(const QVariant& value)
{
    return value.userType() == qMetaTypeId<QJSValue>() ? value.value<QJSValue>().toVariant() : value;
}

/// Qt 6 makes a list of the letters.
bool isText(const QVariant& value)
{
    return value.userType() == QMetaType::QString || value.userType() == QMetaType::QByteArray;
}

QPointF pointOf(const QVariant& value)
{
    return value.userType() == QMetaType::QPointF ? *static_cast<const QPointF*>(value.constData()) : value.toPointF();
}

int percent(double coordinate, double size)
{
    const double value = coordinate * 100.0 / size;
    if (std::isnan(value))
        return 0;
    constexpr auto lowest = double(std::numeric_limits<int>::min());
    constexpr auto highest = double(std::numeric_limits<int>::max());
    return int(value < lowest ? lowest : value > highest ? highest : value);
}

bool isStep(const QPoint& from, const QPoint& to)
{
    return std::abs(qint64(to.x()) - from.x()) + std::abs(qint64(to.y()) - from.y()) >= shortestStep;
}

QList<QPoint> normalized(const QList<QVariant>& points, double width, double height)
{
    QList<QPoint> kept;
    for (const QVariant& value : points) {
        const QPointF pixels = pointOf(value);
        const QPoint point(percent(pixels.x(), width), percent(pixels.y(), height));
        if (kept.isEmpty() || isStep(kept.constLast(), point))
            kept.append(point);
    }
    return kept;
}

} // namespace

HmiHandwritingRecognizer::HmiHandwritingRecognizer(QObject* parent)
    : QObject(parent)
    , m_gate(std::make_shared<RecognizerGate>())
    , m_worker(nullptr)
{
    m_gate->recognizer = this;
    m_worker = new HmiHandwritingRecognizerWorker(this, m_gate);
}

HmiHandwritingRecognizer::~HmiHandwritingRecognizer() = default;

/// Lets the engine work no more. False while it does: then the worker tells when it is done.
bool HmiHandwritingRecognizer::shutDown()
{
    m_gate->deletionWaits = true;
    if (!m_gate->processing.tryLock())
        return false;
    m_gate->deletionWaits = false;
    m_gate->recognizer = nullptr;
    m_gate->processing.unlock();
    return true;
}

/// The engine keeps its object for as long as it works in it; nobody waits for that here.
bool HmiHandwritingRecognizer::event(QEvent* event)
{
    const bool again = event->type() == RecognizerGate::engineRests();
    if (!again && event->type() != QEvent::DeferredDelete)
        return QObject::event(event);
    if (shutDown())
        delete this;
    return true;
}

QVariantList HmiHandwritingRecognizer::strokes() const
{
    return locked(m_strokesLock, m_strokes);
}

QStringList HmiHandwritingRecognizer::candidates() const
{
    return locked(m_candidatesLock, m_candidates);
}

int HmiHandwritingRecognizer::candidateCount() const
{
    return int(candidates().size());
}

int HmiHandwritingRecognizer::maxCandidateCount() const
{
    return locked(m_maxCandidateCountLock, m_maxCandidateCount);
}

double HmiHandwritingRecognizer::inputWidth() const
{
    return locked(m_inputWidthLock, m_inputWidth);
}

double HmiHandwritingRecognizer::inputHeight() const
{
    return locked(m_inputHeightLock, m_inputHeight);
}

void HmiHandwritingRecognizer::setStrokes(const QVariantList& strokes)
{
    if (!store(m_strokesLock, m_strokes, strokes))
        return;
    Q_EMIT strokesChanged(strokes);
    Q_EMIT workerTriggerRecognition();
}

void HmiHandwritingRecognizer::setMaxCandidateCount(int count)
{
    if (count < 1 || !store(m_maxCandidateCountLock, m_maxCandidateCount, count))
        return;
    Q_EMIT maxCandidateCountChanged(count);
    recognizeAgain();
}

void HmiHandwritingRecognizer::setInputWidth(double width)
{
    if (!(width > 0.0) || !store(m_inputWidthLock, m_inputWidth, width))
        return;
    Q_EMIT inputWidthChanged(width);
    recognizeAgain();
}

void HmiHandwritingRecognizer::setInputHeight(double height)
{
    if (!(height > 0.0) || !store(m_inputHeightLock, m_inputHeight, height))
        return;
    Q_EMIT inputHeightChanged(height);
    recognizeAgain();
}

void HmiHandwritingRecognizer::recognizeAgain()
{
    if (!strokes().isEmpty())
        Q_EMIT workerTriggerRecognition();
}

void HmiHandwritingRecognizer::addStrokes(const QVariant& stroke)
{
    qCDebug(coreLog) << Q_FUNC_INFO << "Running from thread:" << QThread::currentThread();
    const QVariant points = plain(stroke);
    {
        const QMutexLocker locker(&m_strokesLock);
        m_strokes.append(points);
    }
    Q_EMIT strokesChanged(m_strokes);
    Q_EMIT workerTriggerNewStrokePreProcessing(points);
}

void HmiHandwritingRecognizer::selectCandidate(int index)
{
    Q_EMIT workerTriggerCandidateSelection(index);
}

void HmiHandwritingRecognizer::processStrokes()
{
    Q_EMIT workerTriggerProcessing();
}

void HmiHandwritingRecognizer::setCandidates(const QStringList& candidates)
{
    if (!store(m_candidatesLock, m_candidates, candidates))
        return;
    Q_EMIT candidatesChanged(candidates);
    Q_EMIT candidateCountChanged(int(candidates.size()));
}

void HmiHandwritingRecognizer::triggerNewStrokePreProcessing(const QVariant& newStroke)
{
    qCDebug(coreLog) << Q_FUNC_INFO << "Running from thread:" << QThread::currentThread();
    newStrokePreProcessing(normalize(newStroke));
}

void HmiHandwritingRecognizer::triggerRecognition()
{
    qCDebug(coreLog) << Q_FUNC_INFO << "Running from thread:" << QThread::currentThread();
    recognition(normalize(strokes()));
}

void HmiHandwritingRecognizer::triggerProcessing()
{
    qCDebug(coreLog) << Q_FUNC_INFO << "Running from thread:" << QThread::currentThread();
    process();
}

void HmiHandwritingRecognizer::triggerCandidateSelection(int index)
{
    qCDebug(coreLog) << Q_FUNC_INFO << "Running from thread:" << QThread::currentThread();
    handleCandidateSelection(index);
}

QList<QList<QPoint>> HmiHandwritingRecognizer::normalize(const QList<QVariant>& strokes)
{
    QList<QList<QPoint>> kept;
    for (const QVariant& stroke : strokes) {
        const QList<QPoint> points = normalize(stroke);
        if (!points.isEmpty())
            kept.append(points);
    }
    return kept;
}

QList<QPoint> HmiHandwritingRecognizer::normalize(const QVariant& stroke)
{
    const double width = inputWidth();
    const double height = inputHeight();
    if (stroke.userType() == QMetaType::QVariantList)
        return normalized(*static_cast<const QVariantList*>(stroke.constData()), width, height);
    return isText(stroke) ? QList<QPoint>() : normalized(stroke.toList(), width, height);
}

} // namespace HmiCore
