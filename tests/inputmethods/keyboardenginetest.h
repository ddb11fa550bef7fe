// SPDX-License-Identifier: MIT
#pragma once

#include "logcapture.h"

#include <HmiCore/HmiComplexKeyboardEngine>
#include <HmiCore/HmiComplexKeyboardEngineFactory>

#include <QObject>

#include <memory>
#include <optional>

using Engine = std::unique_ptr<HmiCore::HmiComplexKeyboardEngine>;

/// What every keyboard engine of the head unit has to do, run for each; its test adds what is its own.
class KeyboardEngineTest : public QObject
{
    Q_OBJECT

protected:
    /// What to type, and what there has to be.
    struct Sample
    {
        const char* syllable;   ///< one, with many candidates
        const char* phrase;     ///< two syllables; the first is \a syllable
        const char* phraseText; ///< the first candidate of \a phrase
        int longest;            ///< how many characters a candidate has at most
    };

    KeyboardEngineTest(HmiCore::HmiComplexKeyboardEngineFactory* factory, const Sample& sample, const char* typedWords);

    Engine makeEngine() const;

    /// One step of a recording: letters are typed one by one, "-" removes, "!" clears, "=text" takes a candidate.
    static void perform(HmiCore::HmiComplexKeyboardEngine& engine, const QString& step);
    static void play(HmiCore::HmiComplexKeyboardEngine& engine, const char* recording);
    static QString text(const char* utf8) { return QString::fromUtf8(utf8); }

    /// Columns and a row of a recording, and what has to be there after it: empty where there is nothing.
    static void addRecordingColumns();
    static void addRecording(const char* name, const char* keys, const char* input, const char* confirmed,
                             const char* candidate);
    void checkRecording() const;

    /// Columns and a row of characters and the keys that type them, empty when there are none.
    static void addKeysColumns();
    static void addKeys(const char* name, const QString& characters, const char* keys);
    static void addCharactersWithoutKeys();
    void checkKeys() const;

    std::optional<LogCapture> m_log;

private Q_SLOTS:
    void init();
    void cleanup();
    void wordsAreFound_data();
    void wordsAreFound();
    void valuesThatAreNoKeysLeaveTheInput_data();
    void valuesThatAreNoKeysLeaveTheInput();
    void inputThatIsTooLongIsNotTaken();
    void indexesThatAreNoCandidatesAreIgnored();
    void candidateOfSomebodyElseIsNotTaken();
    void selectionAfterTheCandidatesChanged();
    void offersAsManyAsWanted();
    void choicesAreNotLearned();
    void confirmedTextMayBeAnything_data();
    void confirmedTextMayBeAnything();
    void inputFromOutsideMayBeAnything_data();
    void inputFromOutsideMayBeAnything();
    void languageChangedWhileTyping();
    void manyEnginesLeaveNothingBehind();
    void keysForTheFirstCharacter();
    void supportedCharactersCanBeTyped();

private:
    HmiCore::HmiComplexKeyboardEngineFactory* const m_factory;
    const Sample m_sample;
    const QString m_typedWords;
};
