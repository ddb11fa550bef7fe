// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiHandwritingRecognizerFactory>

#include <QString>

namespace Zinnia {

/// \brief Makes recognizers of one model, which they share while there is one.
class ZinniaFactory : public HmiCore::HmiHandwritingRecognizerFactory
{
    Q_OBJECT

public:
    explicit ZinniaFactory(const QString& modelFile, QObject* parent = nullptr);

    /// \brief A new recognizer, which opens the model in its own thread; null, with a warning, when there is no such file.
    HmiCore::HmiHandwritingRecognizer* createRecognizer(QObject* parent) override;

private:
    QString m_modelFile;
};

} // namespace Zinnia
