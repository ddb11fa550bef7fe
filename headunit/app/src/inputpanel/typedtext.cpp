// SPDX-License-Identifier: MIT
#include "typedtext.h"

#include <HmiCore/HmiComplexKeyboardEngine>

using HmiCore::HmiComplexKeyboard;
using HmiCore::HmiComplexKeyboardEngine;

namespace {

constexpr int mostCandidates = 40; // more than anybody reads in a car

} // namespace

void TypedText::setLanguage(int language)
{
    drop();
    if (m_engine)
        disconnect(m_engine, nullptr, this, nullptr);
    m_engine = nullptr;
    if (language != HmiComplexKeyboard::Invalid) {
        m_keyboard.setLanguage(language);
        m_engine = m_keyboard.engine();
        m_engine->setMaxCandidateCount(mostCandidates);
        connect(m_engine, &HmiComplexKeyboardEngine::candidatesChanged, this, &TypedText::follow);
        connect(m_engine, &HmiComplexKeyboardEngine::currentInputStringChanged, this, &TypedText::follow);
        connect(m_engine, &HmiComplexKeyboardEngine::currentConfirmedInputStringChanged, this,
                &TypedText::takeConfirmed);
    }
    follow();
}

void TypedText::type(const QString& text)
{
    withdrawOffer();
    if (isTaken(text))
        return;
    finish();
    Q_EMIT committed(text);
}

/// False when the engine does not take it, or there is none.
bool TypedText::isTaken(const QString& text)
{
    if (!m_engine)
        return false;
    const QVariantList before = m_engine->currentInput();
    m_engine->addInput(text);
    return m_engine->currentInput() != before;
}

void TypedText::space()
{
    withdrawOffer();
    const QString space(QLatin1Char(' '));
    if (!m_engine || m_engine->currentInput().isEmpty())
        Q_EMIT committed(space);
    else if (!isTaken(space))
        finish();
}

void TypedText::commitLetters()
{
    const QString letters = preliminary();
    if (letters.isEmpty())
        return;
    drop();
    Q_EMIT committed(letters);
}

void TypedText::offer(const QStringList& texts)
{
    m_offered = texts;
    follow();
}

void TypedText::withdrawOffer()
{
    m_offered.clear();
    follow();
}

void TypedText::select(int candidate)
{
    if (candidate < 0 || candidate >= candidates().size())
        return;
    if (!m_offered.isEmpty())
        type(candidates().at(candidate)); // which withdraws the offer
    else
        m_engine->selectCandidate(candidate);
}

bool TypedText::takeBack()
{
    withdrawOffer();
    if (!m_engine || m_engine->currentInput().isEmpty())
        return false;
    m_engine->removeInput();
    return true;
}

/// Each choice may be of a part of the input only.
void TypedText::finish()
{
    withdrawOffer();
    while (m_engine && !m_engine->currentInput().isEmpty() && !candidates().isEmpty()) {
        const auto before = m_engine->currentInput().size();
        select(0);
        if (m_engine->currentInput().size() >= before)
            break;
    }
    commitLetters();
}

void TypedText::drop()
{
    withdrawOffer();
    if (m_engine)
        m_engine->clearInput();
}

void TypedText::follow()
{
    const QStringList candidates = m_engine ? m_engine->candidates() : QStringList();
    show(m_offered.isEmpty() ? candidates : m_offered, m_engine ? m_engine->currentInputString() : QString());
}

void TypedText::takeConfirmed()
{
    const QString text = m_engine->currentConfirmedInputString();
    if (text.isEmpty())
        return;
    m_engine->setCurrentConfirmedInputString(QString());
    Q_EMIT committed(text);
}
