// SPDX-License-Identifier: MIT
#pragma once

#include <QEvent>
#include <QMutex>
#include <QObject>
#include <QPointer>
#include <QVariant>

#include <atomic>
#include <memory>

QT_BEGIN_NAMESPACE
class QThread;
QT_END_NAMESPACE

namespace HmiCore {

class HmiHandwritingRecognizer;

/// What a recognizer and its worker share, and whoever of them lives longer keeps.
struct RecognizerGate
{
    QMutex processing;                              ///< held while the engine works
    HmiHandwritingRecognizer* recognizer = nullptr; ///< null when it is about to be destroyed; guarded by processing
    std::atomic<bool> deletionWaits{false};         ///< the recognizer is to be deleted when the engine is done

    /// Posted to the recognizer whose deletion waited: Qt drops a second deferred deletion while other events are queued.
    static QEvent::Type engineRests();
};

/// Carries what a recognizer is asked for into a thread of its own, in which it lives, and ends that with the recognizer.
class HmiHandwritingRecognizerWorker : public QObject
{
    Q_OBJECT

public:
    HmiHandwritingRecognizerWorker(HmiHandwritingRecognizer* recognizer, std::shared_ptr<RecognizerGate> gate);
    ~HmiHandwritingRecognizerWorker() override;

private Q_SLOTS:
    void triggerNewStrokePreProcessing(const QVariant& newStroke);
    void triggerProcessing();
    void triggerRecognition();
    void triggerCandidateSelection(int index);

private:
    template <typename Operation>
    void work(Operation operation);

    const QPointer<HmiHandwritingRecognizer> m_recognizer;
    QThread* const m_thread;
    const std::shared_ptr<RecognizerGate> m_gate;
};

} // namespace HmiCore
