// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QObject>

namespace HmiCore {

class HmiHandwritingRecognizer;

/// \brief Makes the recognizers of one engine. The input-method plugin owns it. GUI thread only.
class HMICORE_EXPORT HmiHandwritingRecognizerFactory : public QObject
{
    Q_OBJECT

public:
    explicit HmiHandwritingRecognizerFactory(QObject* parent);
    ~HmiHandwritingRecognizerFactory() override;

    /// \brief A new recognizer with this parent; null when it cannot be made, such as without its model.
    virtual HmiHandwritingRecognizer* createRecognizer(QObject* parent) = 0;
};

} // namespace HmiCore
