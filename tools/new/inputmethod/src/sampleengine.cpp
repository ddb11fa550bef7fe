// SPDX-License-Identifier: MIT
#include "sampleengine.h"

namespace {

constexpr int longestWord = 60; // letters; the input has to be bounded

bool isLetter(const QString& text)
{
    return text.size() == 1 && text.at(0).isLetter();
}

} // namespace

SampleEngine::SampleEngine(QObject* parent)
    : HmiComplexKeyboardEngine(parent)
{
}

/// A key is whatever QML sends: what is no letter is taken out of the input again.
void SampleEngine::handleNewInputValue(const QVariant& value)
{
    const bool isTaken = isLetter(value.toString()) && currentInput().size() <= longestWord;
    if (!isTaken)
        setInput(currentInput().mid(0, currentInput().size() - 1));
    offerCandidates();
}

void SampleEngine::handleInputValueRemoved()
{
    offerCandidates();
}

void SampleEngine::handleInputCleared()
{
    offerCandidates();
}

void SampleEngine::handleCandidateSelection(int index)
{
    const QString word = candidates().value(index);
    if (word.isEmpty()) // there is none of this index any more
        return;
    setInput({});
    offerCandidates();
    setCurrentConfirmedInputString(currentConfirmedInputString() + word);
}

void SampleEngine::handleMaxCandidateCountChanged()
{
    offerCandidates();
}

QVariant SampleEngine::handleCharactersInputRequest(const QString& characters)
{
    QVariantList keys;
    for (const QChar character : characters) {
        if (!supported(character))
            return QVariant();
        keys.append(QString(character));
    }
    return keys.isEmpty() ? QVariant() : keys;
}

QVariant SampleEngine::handleCharacterInputRequest(const QChar& character)
{
    return handleCharactersInputRequest(character);
}

bool SampleEngine::supported(const QChar& character) const
{
    return character.isLetter();
}

void SampleEngine::offerCandidates()
{
    const QString word = currentInputString();
    QStringList words;
    if (!word.isEmpty())
        words << word.toLower() << word.left(1).toUpper() + word.mid(1).toLower() << word.toUpper();
    words.removeDuplicates();
    setCandidates(words.mid(0, maxCandidateCount()));
}
