// SPDX-License-Identifier: MIT
#include "hmihandwritingrecognizerworker.h"

#include "hmihandwritingrecognizer.h"
#include "workerthreads.h"

#include <QCoreApplication>
#include <QMutexLocker>
#include <QThread>

#include <utility>

namespace HmiCore {

QEvent::Type RecognizerGate::engineRests()
{
    static const auto s_type = QEvent::Type(QEvent::registerEventType());
    return s_type;
}

HmiHandwritingRecognizerWorker::HmiHandwritingRecognizerWorker(HmiHandwritingRecognizer* recognizer,
                                                               std::shared_ptr<RecognizerGate> gate)
    : m_recognizer(recognizer)
    , m_thread(new QThread)
    , m_gate(std::move(gate))
{
    moveToThread(m_thread);
    WorkerThreads::add(m_thread, this);
    using Recognizer = HmiHandwritingRecognizer;
    using Worker = HmiHandwritingRecognizerWorker;
    connect(recognizer, &QObject::destroyed, this, &QObject::deleteLater);
    connect(recognizer, &Recognizer::workerTriggerRecognition, this, &Worker::triggerRecognition);
    connect(recognizer, &Recognizer::workerTriggerNewStrokePreProcessing, this, &Worker::triggerNewStrokePreProcessing);
    connect(recognizer, &Recognizer::workerTriggerProcessing, this, &Worker::triggerProcessing);
    connect(recognizer, &Recognizer::workerTriggerCandidateSelection, this, &Worker::triggerCandidateSelection);
    // A thread that still runs must not be deleted: so it is once it has ended.
    connect(m_thread, &QThread::finished, m_thread, &QObject::deleteLater);
    m_thread->start();
}

/// In the own thread.
HmiHandwritingRecognizerWorker::~HmiHandwritingRecognizerWorker()
{
    m_thread->exit(0);
}

template <typename Operation>
void HmiHandwritingRecognizerWorker::work(Operation operation)
{
    {
        const QMutexLocker locker(&m_gate->processing);
        if (m_recognizer && m_gate->recognizer)
            operation(m_gate->recognizer);
    }
    // Asked whenever the lock has been released, here too: who finds it taken has left the wish before.
    while (m_gate->deletionWaits.exchange(false)) {
        const QMutexLocker locker(&m_gate->processing);
        if (m_gate->recognizer)
            QCoreApplication::postEvent(m_gate->recognizer, new QEvent(RecognizerGate::engineRests()));
    }
}

void HmiHandwritingRecognizerWorker::triggerNewStrokePreProcessing(const QVariant& newStroke)
{
    work([&newStroke](HmiHandwritingRecognizer* recognizer) { recognizer->triggerNewStrokePreProcessing(newStroke); });
}

void HmiHandwritingRecognizerWorker::triggerProcessing()
{
    work([](HmiHandwritingRecognizer* recognizer) { recognizer->triggerProcessing(); });
}

void HmiHandwritingRecognizerWorker::triggerRecognition()
{
    work([](HmiHandwritingRecognizer* recognizer) { recognizer->triggerRecognition(); });
}

void HmiHandwritingRecognizerWorker::triggerCandidateSelection(int index)
{
    work([index](HmiHandwritingRecognizer* recognizer) { recognizer->triggerCandidateSelection(index); });
}

} // namespace HmiCore
