// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiComplexKeyboardEngine>

#include <memory>

namespace Pinyin {

class PinyinDecoder;

/// \brief Turns letters into Chinese text. GUI thread only.
///
/// The input is the letters, one value each, that are not decided on yet; a key may type several. A candidate that is
/// selected is appended to the confirmed text and takes its letters out of the input. Without input, the candidates are
/// what may follow the text that was confirmed last.
class PinyinEngine : public HmiCore::HmiComplexKeyboardEngine
{
    Q_OBJECT

public:
    PinyinEngine(std::shared_ptr<PinyinDecoder> decoder, QObject* parent);
    ~PinyinEngine() override;

protected:
    void handleNewInputValue(const QVariant& value) override;
    void handleInputValueRemoved() override;
    void handleInputCleared() override;
    void handleCandidateSelection(int index) override;
    void handleMaxCandidateCountChanged() override;
    void handleNewConfirmedInputString(const QString& input) override;
    QVariant handleCharactersInputRequest(const QString& characters) override;
    QVariant handleCharacterInputRequest(const QChar& character) override;
    bool supported(const QChar& character) const override;

private:
    void setLetters(const QString& letters);
    void offerCandidates();

    std::shared_ptr<PinyinDecoder> m_decoder;
    QString m_letters;
    QString m_history; ///< what was confirmed last
};

} // namespace Pinyin
