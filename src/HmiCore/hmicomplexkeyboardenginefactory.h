// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QObject>

namespace HmiCore {

class HmiComplexKeyboardEngine;

/// \brief Makes the engines of complex keyboards. The input-method plugin owns it. GUI thread only.
class HMICORE_EXPORT HmiComplexKeyboardEngineFactory : public QObject
{
    Q_OBJECT

public:
    explicit HmiComplexKeyboardEngineFactory(QObject* parent);
    ~HmiComplexKeyboardEngineFactory() override;

    /// \brief A new engine with this parent; null when it cannot be made, such as without its dictionary.
    virtual HmiComplexKeyboardEngine* createEngine(QObject* parent) = 0;
};

} // namespace HmiCore
