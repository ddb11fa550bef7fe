// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiComplexKeyboardEngine>

/// \brief Offers the typed word in small and capital letters; put your own candidates in their place.
///
/// All operations run in the GUI thread, between two frames: a few milliseconds are all they have.
class SampleEngine : public HmiCore::HmiComplexKeyboardEngine
{
    Q_OBJECT

public:
    explicit SampleEngine(QObject* parent);

protected:
    void handleNewInputValue(const QVariant& value) override;
    void handleInputValueRemoved() override;
    void handleInputCleared() override;
    void handleCandidateSelection(int index) override;
    void handleMaxCandidateCountChanged() override;
    QVariant handleCharactersInputRequest(const QString& characters) override;
    QVariant handleCharacterInputRequest(const QChar& character) override;
    bool supported(const QChar& character) const override;

private:
    void offerCandidates();
};
