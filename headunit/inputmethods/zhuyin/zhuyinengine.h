// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiComplexKeyboardEngine>

#include <memory>

namespace Zhuyin {

class ZhuyinDecoder;

/// \brief Turns Bopomofo into Chinese text. GUI thread only.
///
/// The input is the symbols, one value each, that are not decided on yet. A candidate that is selected is appended to the
/// confirmed text and takes its syllables out of the input.
class ZhuyinEngine : public HmiCore::HmiComplexKeyboardEngine
{
    Q_OBJECT

public:
    ZhuyinEngine(std::unique_ptr<ZhuyinDecoder> decoder, QObject* parent);
    ~ZhuyinEngine() override;

    /// \brief Lets the library read what it needs for the first key.
    void warmUp();

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
    bool takes(QChar symbol);
    void setSymbols(const QString& symbols);
    void offerCandidates();

    std::unique_ptr<ZhuyinDecoder> m_decoder;
    QString m_symbols;
};

} // namespace Zhuyin
