// SPDX-License-Identifier: MIT
#include "pinyinengine.h"

#include "pinyindecoder.h"

#include <algorithm>

namespace Pinyin {

namespace {

constexpr int maxLetters = 60;

const QChar separator = QLatin1Char('\'');

bool isKey(QChar letter)
{
    return letter == separator || (letter >= QLatin1Char('a') && letter <= QLatin1Char('z'));
}

/// The letters that a key types, none when it is not one of this keyboard. Infinity, a number, is none.
QString lettersOf(const QVariant& value)
{
    if (value.userType() != QMetaType::QString && value.userType() != QMetaType::QChar)
        return QString();
    QString letters = value.toString().toLower();
    letters.replace(QChar(0xFC), QLatin1Char('v'));
    return std::all_of(letters.cbegin(), letters.cend(), isKey) ? letters : QString();
}

QString withoutLeadingSeparators(const QString& letters)
{
    const auto first = std::find_if(letters.cbegin(), letters.cend(), [](QChar letter) { return letter != separator; });
    return letters.mid(int(first - letters.cbegin()));
}

QVariantList keysOf(const QString& letters)
{
    QVariantList keys;
    for (const QChar letter : letters)
        keys.append(QString(letter));
    return keys;
}

} // namespace

PinyinEngine::PinyinEngine(std::shared_ptr<PinyinDecoder> decoder, QObject* parent)
    : HmiComplexKeyboardEngine(parent)
    , m_decoder(std::move(decoder))
{
}

PinyinEngine::~PinyinEngine() = default;

void PinyinEngine::handleNewInputValue(const QVariant& value)
{
    const QString letters = m_letters + lettersOf(value);
    setLetters(letters.size() > maxLetters ? m_letters : letters);
    offerCandidates();
}

void PinyinEngine::handleInputValueRemoved()
{
    setLetters(m_letters.left(m_letters.size() - 1));
    offerCandidates();
}

void PinyinEngine::handleInputCleared()
{
    m_letters.clear();
    m_history.clear();
    setCandidates(QStringList());
}

void PinyinEngine::handleCandidateSelection(int index)
{
    const QString wanted = candidates().value(index);
    if (wanted.isEmpty())
        return;
    if (!m_letters.isEmpty()) {
        const PinyinDecoder::Choice choice = m_decoder->choose(m_letters, index);
        if (choice.text != wanted) // somebody else put it among the candidates
            return;
        setLetters(m_letters.mid(choice.letters));
    }
    setCurrentConfirmedInputString(currentConfirmedInputString() + wanted);
}

void PinyinEngine::handleMaxCandidateCountChanged()
{
    offerCandidates();
}

/// The text becomes empty when somebody takes it; what may follow it stays on offer.
void PinyinEngine::handleNewConfirmedInputString(const QString& input)
{
    if (input.isEmpty())
        return;
    m_history = input;
    offerCandidates();
}

/// A syllable that begins with a vowel would join the one before it.
QVariant PinyinEngine::handleCharactersInputRequest(const QString& characters)
{
    const QString vowels = QStringLiteral("aeo");
    QString all;
    for (const QChar character : characters) {
        const QString letters = m_decoder->keysFor(character);
        if (letters.isEmpty())
            return QVariant();
        if (!all.isEmpty() && vowels.contains(letters.at(0)))
            all.append(separator);
        all.append(letters);
    }
    return all.isEmpty() ? QVariant() : keysOf(all);
}

QVariant PinyinEngine::handleCharacterInputRequest(const QChar& character)
{
    return handleCharactersInputRequest(character);
}

bool PinyinEngine::supported(const QChar& character) const
{
    return !m_decoder->keysFor(character).isEmpty();
}

void PinyinEngine::setLetters(const QString& letters)
{
    m_letters = withoutLeadingSeparators(letters);
    setInput(keysOf(m_letters));
}

void PinyinEngine::offerCandidates()
{
    setCandidates(m_letters.isEmpty() ? m_decoder->predictions(m_history, maxCandidateCount())
                                      : m_decoder->candidates(m_letters, maxCandidateCount()));
}

} // namespace Pinyin
