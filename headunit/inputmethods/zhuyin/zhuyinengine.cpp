// SPDX-License-Identifier: MIT
#include "zhuyinengine.h"

#include "bopomofo.h"
#include "zhuyindecoder.h"

#include <algorithm>

namespace Zhuyin {

namespace {

constexpr int mostSyllables = 20;

/// The first tone has no mark of its own on most keyboards.
QChar symbolOf(const QVariant& value)
{
    const QString text = value.toString();
    if (text.size() != 1)
        return QChar();
    return text == QLatin1String(" ") ? QChar(u'ˉ') : text.at(0);
}

QVariantList keysOf(const QString& symbols)
{
    QVariantList keys;
    for (const QChar symbol : symbols)
        keys.append(QString(symbol));
    return keys;
}

QString withoutSyllables(const QString& symbols, int count)
{
    int position = 0;
    for (; count > 0 && position < symbols.size(); ++position)
        if (isTone(symbols.at(position)))
            --count;
    return symbols.mid(position);
}

} // namespace

ZhuyinEngine::ZhuyinEngine(std::unique_ptr<ZhuyinDecoder> decoder, QObject* parent)
    : HmiComplexKeyboardEngine(parent)
    , m_decoder(std::move(decoder))
{
}

ZhuyinEngine::~ZhuyinEngine() = default;

void ZhuyinEngine::warmUp()
{
    m_decoder->candidates(QStringLiteral("ㄅㄚˉ"), 1);
}

void ZhuyinEngine::handleNewInputValue(const QVariant& value)
{
    const QChar symbol = symbolOf(value);
    setSymbols(takes(symbol) ? m_symbols + symbol : m_symbols);
}

void ZhuyinEngine::handleInputValueRemoved()
{
    setSymbols(m_symbols.left(m_symbols.size() - 1));
}

void ZhuyinEngine::handleInputCleared()
{
    m_symbols.clear();
    offerCandidates();
}

void ZhuyinEngine::handleCandidateSelection(int index)
{
    const QString wanted = candidates().value(index);
    if (wanted.isEmpty() || m_decoder->candidates(m_symbols, maxCandidateCount()).value(index) != wanted)
        return;
    setSymbols(withoutSyllables(m_symbols, int(wanted.toUcs4().size())));
    setCurrentConfirmedInputString(currentConfirmedInputString() + wanted);
}

void ZhuyinEngine::handleMaxCandidateCountChanged()
{
    offerCandidates();
}

QVariant ZhuyinEngine::handleCharactersInputRequest(const QString& characters)
{
    QString all;
    for (const QChar character : characters) {
        const QString symbols = m_decoder->keysFor(character);
        if (symbols.isEmpty())
            return QVariant();
        all.append(symbols);
    }
    return all.isEmpty() ? QVariant() : keysOf(all);
}

QVariant ZhuyinEngine::handleCharacterInputRequest(const QChar& character)
{
    return handleCharactersInputRequest(character);
}

bool ZhuyinEngine::supported(const QChar& character) const
{
    return !m_decoder->keysFor(character).isEmpty();
}

/// A tone closes only a syllable that there is.
bool ZhuyinEngine::takes(QChar symbol)
{
    if (!mayFollow(m_symbols, symbol))
        return false;
    if (isTone(symbol))
        return m_decoder->converts(m_symbols + symbol);
    return std::count_if(m_symbols.cbegin(), m_symbols.cend(), isTone) < mostSyllables;
}

void ZhuyinEngine::setSymbols(const QString& symbols)
{
    m_symbols = symbols;
    setInput(keysOf(m_symbols));
    offerCandidates();
}

void ZhuyinEngine::offerCandidates()
{
    setCandidates(m_decoder->candidates(m_symbols, maxCandidateCount()));
}

} // namespace Zhuyin
