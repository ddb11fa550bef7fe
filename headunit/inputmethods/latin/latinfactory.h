// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiHandwritingRecognizerFactory>

namespace Latin {

/// \brief Makes recognizers, which share what characters look like.
class LatinFactory : public HmiCore::HmiHandwritingRecognizerFactory
{
    Q_OBJECT

public:
    explicit LatinFactory(QObject* parent = nullptr);

    /// \brief A new recognizer, which gets ready in its own thread. Never null.
    HmiCore::HmiHandwritingRecognizer* createRecognizer(QObject* parent) override;
};

} // namespace Latin
