// SPDX-License-Identifier: MIT
#include "dummyengine.h"

#include "logcategories.h"

namespace HmiCore {

namespace {

void warn()
{
    qCWarning(coreLog) << "Using a dummy engine, don't expect too much.";
}

} // namespace

DummyEngine::DummyEngine(QObject* parent)
    : HmiComplexKeyboardEngine(parent)
{
}

DummyEngine::~DummyEngine() = default;

void DummyEngine::handleNewInputValue(const QVariant&)
{
    warn();
}

void DummyEngine::handleInputValueRemoved()
{
    warn();
}

void DummyEngine::handleInputCleared()
{
    warn();
}

void DummyEngine::handleCandidateSelection(int)
{
    warn();
}

QVariant DummyEngine::handleCharactersInputRequest(const QString&)
{
    warn();
    return QVariant();
}

QVariant DummyEngine::handleCharacterInputRequest(const QChar&)
{
    warn();
    return QVariant();
}

bool DummyEngine::supported(const QChar&) const
{
    return true;
}

} // namespace HmiCore
