// SPDX-License-Identifier: MIT
#include "hmicomplexkeyboardengine.h"

#include <QJSValue>

#include <algorithm>

namespace HmiCore {

HmiComplexKeyboardEngine::HmiComplexKeyboardEngine(QObject* parent)
    : QObject(parent)
{
}

HmiComplexKeyboardEngine::~HmiComplexKeyboardEngine() = default;

QVariantList HmiComplexKeyboardEngine::currentInput() const
{
    return m_currentInput;
}

QString HmiComplexKeyboardEngine::currentInputString() const
{
    return m_currentInputString;
}

QString HmiComplexKeyboardEngine::currentConfirmedInputString() const
{
    return m_currentConfirmedInputString;
}

QStringList HmiComplexKeyboardEngine::candidates() const
{
    return m_candidates;
}

int HmiComplexKeyboardEngine::candidateCount() const
{
    return int(m_candidates.size());
}

int HmiComplexKeyboardEngine::maxCandidateCount() const
{
    return m_maxCandidateCount;
}

void HmiComplexKeyboardEngine::addInput(const QVariant& input)
{
    if (input.userType() == qMetaTypeId<QJSValue>())
        return addInput(input.value<QJSValue>().toVariant()); // a list or an object of QML
    m_currentInput.append(input);
    m_currentInputString.append(input.toString());
    Q_EMIT currentInputChanged(m_currentInput);
    Q_EMIT currentInputStringChanged(m_currentInputString);
    handleNewInputValue(input);
}

void HmiComplexKeyboardEngine::removeInput()
{
    if (m_currentInput.isEmpty())
        return;
    if (m_currentInput.size() == m_currentInputString.size()) { // else the engine mends its text
        m_currentInputString.chop(1);
        Q_EMIT currentInputStringChanged(m_currentInputString);
    }
    m_currentInput.removeLast();
    Q_EMIT currentInputChanged(m_currentInput);
    handleInputValueRemoved();
}

void HmiComplexKeyboardEngine::clearInput()
{
    m_currentInput.clear();
    m_currentInputString.clear();
    Q_EMIT currentInputChanged(m_currentInput);
    Q_EMIT currentInputStringChanged(m_currentInputString);
    handleInputCleared();
}

void HmiComplexKeyboardEngine::selectCandidate(int index)
{
    handleCandidateSelection(index);
}

void HmiComplexKeyboardEngine::setMaxCandidateCount(int count)
{
    if (count < 1 || count == m_maxCandidateCount)
        return;
    m_maxCandidateCount = count;
    Q_EMIT maxCandidateCountChanged(count);
    handleMaxCandidateCountChanged();
}

void HmiComplexKeyboardEngine::setCandidates(const QStringList& candidates)
{
    if (candidates == m_candidates)
        return;
    m_candidates = candidates;
    Q_EMIT candidatesChanged(m_candidates);
    Q_EMIT candidateCountChanged(candidateCount());
}

void HmiComplexKeyboardEngine::setCurrentConfirmedInputString(const QString& input)
{
    if (input == m_currentConfirmedInputString)
        return;
    m_currentConfirmedInputString = input;
    Q_EMIT currentConfirmedInputStringChanged(input);
    handleNewConfirmedInputString(input);
}

void HmiComplexKeyboardEngine::setInput(const QList<QVariant>& input)
{
    if (input == m_currentInput)
        return;
    m_currentInput = input;
    m_currentInputString.clear();
    for (const QVariant& value : input)
        m_currentInputString.append(value.toString());
    Q_EMIT currentInputChanged(m_currentInput);
    Q_EMIT currentInputStringChanged(m_currentInputString);
}

void HmiComplexKeyboardEngine::setInputString(const QString& input)
{
    if (input == m_currentInputString)
        return;
    m_currentInputString = input;
    m_currentInput.clear();
    for (const QChar character : input)
        m_currentInput.append(character);
    Q_EMIT currentInputChanged(m_currentInput);
    Q_EMIT currentInputStringChanged(m_currentInputString);
}

QVariant HmiComplexKeyboardEngine::inputForCharacters(const QString& characters)
{
    return handleCharactersInputRequest(characters);
}

QVariant HmiComplexKeyboardEngine::inputForFirstCharacter(const QString& characters)
{
    return characters.isEmpty() ? QVariant() : handleCharacterInputRequest(characters.at(0));
}

bool HmiComplexKeyboardEngine::characterSupported(const QString& character)
{
    return !character.isEmpty()
           && std::all_of(character.begin(), character.end(), [this](QChar unit) { return supported(unit); });
}

void HmiComplexKeyboardEngine::handleMaxCandidateCountChanged() {}

void HmiComplexKeyboardEngine::handleNewConfirmedInputString(const QString&) {}

} // namespace HmiCore
