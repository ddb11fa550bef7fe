// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiComplexKeyboardEngineFactory>

#include <QString>

namespace Pinyin {

/// \brief Makes engines that share the decoder, which stays open from the first on.
class PinyinFactory : public HmiCore::HmiComplexKeyboardEngineFactory
{
    Q_OBJECT

public:
    /// \brief With the dictionary that belongs to the library.
    explicit PinyinFactory(QObject* parent = nullptr);
    PinyinFactory(const QString& dictionary, QObject* parent);

    /// \brief A new engine; null, with a warning, when the dictionary cannot be opened.
    HmiCore::HmiComplexKeyboardEngine* createEngine(QObject* parent) override;

private:
    QString m_dictionary;
};

} // namespace Pinyin
