// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QMutex>
#include <QObject>
#include <QPoint>
#include <QStringList>
#include <QVariant>

#include <memory>

namespace HmiCore {

class HmiHandwritingRecognizerWorker;
struct RecognizerGate;

/// \brief The base of all handwriting engines: what is written, what it may be, and a thread in which the engine works.
///
/// Properties and slots are for the GUI thread; getters and setCandidates() for any. The engine's operations, the pure virtual
/// ones, and normalize() run in the recognizer's own thread, one at a time. So nothing here waits for an engine.
///
/// Delete it with deleteLater(), at any moment: while the engine works, that is put off until it is done. `delete` does not wait
/// either, and is for a recognizer whose engine is known to rest.
class HMICORE_EXPORT HmiHandwritingRecognizer : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QVariantList strokes READ strokes WRITE setStrokes NOTIFY strokesChanged)
    Q_PROPERTY(QStringList candidates READ candidates NOTIFY candidatesChanged)
    Q_PROPERTY(int candidateCount READ candidateCount NOTIFY candidateCountChanged)
    Q_PROPERTY(int maxCandidateCount READ maxCandidateCount WRITE setMaxCandidateCount NOTIFY maxCandidateCountChanged)
    Q_PROPERTY(double inputWidth READ inputWidth WRITE setInputWidth NOTIFY inputWidthChanged)
    Q_PROPERTY(double inputHeight READ inputHeight WRITE setInputHeight NOTIFY inputHeightChanged)

public:
    explicit HmiHandwritingRecognizer(QObject* parent);
    ~HmiHandwritingRecognizer() override;

    QVariantList strokes() const;   ///< each a list of points, in pixels of the writing area
    QStringList candidates() const; ///< what the strokes may be, the most likely first
    int candidateCount() const;     ///< how many candidates there are
    int maxCandidateCount() const;  ///< how many are wanted at most; 10 by default
    double inputWidth() const;      ///< pixels of the writing area; 100 by default
    double inputHeight() const;     ///< pixels of the writing area; 100 by default

    /// \brief normalize() of each stroke; those that come out empty are left out.
    virtual QList<QList<QPoint>> normalize(const QList<QVariant>& strokes);

    /// \brief The points of a stroke in per cent of the writing area, cut to whole numbers, without those that are closer than
    /// two steps to the one before.
    ///
    /// What is no point counts as the origin; what is no number as 0; what no integer can hold as the nearest that can.
    virtual QList<QPoint> normalize(const QVariant& stroke);

    /// \brief Recognises all strokes and publishes what they may be with setCandidates(). In the own thread, as those below.
    virtual void recognition(const QList<QList<QPoint>>& strokes) = 0;
    virtual void process() = 0; ///< what processStrokes() asks for
    /// \brief Takes in one more stroke.
    virtual void newStrokePreProcessing(const QList<QPoint>& stroke) = 0;
    /// \brief The user took a candidate; there may be none of this index any more.
    virtual void handleCandidateSelection(int index) = 0;

public Q_SLOTS:
    /// \brief Replaces all strokes and recognises them; equal ones change nothing.
    void setStrokes(const QVariantList& strokes);
    void setMaxCandidateCount(int count); ///< below 1 is ignored; recognises again
    void setInputWidth(double width);     ///< 0 and below is ignored; recognises again
    void setInputHeight(double height);   ///< 0 and below is ignored; recognises again
    /// \brief Appends a stroke and lets the engine take it in; recognises nothing yet.
    void addStrokes(const QVariant& stroke);
    /// \brief Tells the engine that the user took a candidate. \a index is passed on as it is.
    void selectCandidate(int index);
    /// \brief Asks the engine for whatever it takes this for.
    void processStrokes();

Q_SIGNALS:
    void strokesChanged(const QVariantList& strokes);
    void candidatesChanged(const QStringList& candidates);
    void candidateCountChanged(int count);
    void maxCandidateCountChanged(int count);
    void inputWidthChanged(double width);
    void inputHeightChanged(double height);

    void workerTriggerRecognition(); ///< to the own thread: recognition()
    void
    workerTriggerNewStrokePreProcessing(const QVariant& newStroke); ///< to the own thread: newStrokePreProcessing()
    void workerTriggerProcessing();                                 ///< to the own thread: process()
    void workerTriggerCandidateSelection(int index);                ///< to the own thread: handleCandidateSelection()

protected:
    bool event(QEvent* event) override;

protected Q_SLOTS:
    /// \brief Publishes candidates. Any thread.
    void setCandidates(const QStringList& candidates);

private:
    friend class HmiHandwriting;
    friend class HmiHandwritingRecognizerWorker;

    bool shutDown();
    void triggerNewStrokePreProcessing(const QVariant& newStroke);
    void triggerRecognition();
    void triggerProcessing();
    void triggerCandidateSelection(int index);
    void recognizeAgain();

    mutable QMutex m_strokesLock;
    QVariantList m_strokes;
    mutable QMutex m_candidatesLock;
    QStringList m_candidates;
    mutable QMutex m_maxCandidateCountLock;
    int m_maxCandidateCount = 10;
    mutable QMutex m_inputWidthLock;
    double m_inputWidth = 100.0;
    mutable QMutex m_inputHeightLock;
    double m_inputHeight = 100.0;
    std::shared_ptr<RecognizerGate> m_gate; ///< with the lock that is held while the engine works
    HmiHandwritingRecognizerWorker* m_worker;
};

} // namespace HmiCore
