// SPDX-License-Identifier: MIT
#pragma once

#include "logcapture.h"
#include "recordings.h"

#include <HmiCore/HmiHandwritingRecognizer>
#include <HmiCore/HmiHandwritingRecognizerFactory>

#include <QObject>

#include <memory>
#include <optional>

struct DeleteLater
{
    void operator()(QObject* object) const { object->deleteLater(); }
};
using Recognizer = std::unique_ptr<HmiCore::HmiHandwritingRecognizer, DeleteLater>;

/// What every handwriting engine of the head unit has to do, run for each; its test adds what is its own.
class HandwritingEngineTest : public QObject
{
    Q_OBJECT

protected:
    /// An engine, and two characters of \a recordings that it knows.
    HandwritingEngineTest(HmiCore::HmiHandwritingRecognizerFactory* factory, const char* recordings, const char* one,
                          const char* other);

    Recognizer makeRecognizer() const;
    QVariantList strokesOf(const QString& character) const;
    static bool offers(const Recognizer& recognizer, const QString& character);
    static bool offersNothing(const Recognizer& recognizer);
    /// Recognises something, so that all that was asked for before is done.
    bool answersStill(const Recognizer& recognizer) const;

    const QString m_one;
    const QString m_other;
    std::optional<LogCapture> m_log;

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void candidatesFollowEachStroke();
    void offersAsManyAsWanted();
    void sizeOfTheWritingAreaDoesNotMatter();
    void selectionClears();
    void selectionKeepsTheStrokesBegunSince();
    void selectionLeavesStrokesThatCameInsteadOfThoseSelected();
    void selectionAfterTheCandidatesChanged();
    void indexesThatAreNoCandidatesAreIgnored();
    void nothingWrittenOffersNothing();
    void oddStrokesDoNoHarm_data();
    void oddStrokesDoNoHarm();
    void oddSizesDoNoHarm_data();
    void oddSizesDoNoHarm();
    void recognizersWorkAtTheSameTime();
    void deletedWhileItWorks_data();
    void deletedWhileItWorks();
    void languageChangedWhileItWorks();
    void manyRecognizersLeaveNothingBehind();
    void candidatesComeFromTheOwnThread();

private:
    HmiCore::HmiHandwritingRecognizerFactory* const m_factory;
    const QString m_file;
    QList<Recording> m_written;
};
