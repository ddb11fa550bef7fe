// SPDX-License-Identifier: MIT
#pragma once

#include "hmicomplexkeyboardengine.h"

namespace HmiCore {

/// \brief Stands in for an engine that is missing: each use is a warning, and there are no candidates.
class HMICORE_EXPORT DummyEngine : public HmiComplexKeyboardEngine
{
    Q_OBJECT

public:
    explicit DummyEngine(QObject* parent);
    ~DummyEngine() override;

protected:
    void handleNewInputValue(const QVariant& value) override;
    void handleInputValueRemoved() override;
    void handleInputCleared() override;
    void handleCandidateSelection(int index) override;
    QVariant handleCharactersInputRequest(const QString& characters) override;
    QVariant handleCharacterInputRequest(const QChar& character) override;
    bool supported(const QChar& character) const override; ///< always
};

} // namespace HmiCore
