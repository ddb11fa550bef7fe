// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiComplexKeyboardEngineFactory>

#include <QString>

namespace Zhuyin {

/// \brief Makes engines, each with a context of the library.
class ZhuyinFactory : public HmiCore::HmiComplexKeyboardEngineFactory
{
    Q_OBJECT

public:
    /// \brief With the folder of the dictionary that belongs to the library.
    explicit ZhuyinFactory(QObject* parent = nullptr);
    ZhuyinFactory(const QString& dictionary, QObject* parent);

    /// \brief A new engine; null, with a warning, when the dictionary cannot be opened.
    HmiCore::HmiComplexKeyboardEngine* createEngine(QObject* parent) override;

private:
    QString m_dictionary;
};

} // namespace Zhuyin
