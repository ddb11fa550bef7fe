// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiComplexKeyboardEngineFactory>

/// \brief Makes an engine for each keyboard.
class SampleFactory : public HmiCore::HmiComplexKeyboardEngineFactory
{
    Q_OBJECT

public:
    SampleFactory();

    /// \brief Called in the GUI thread, so it must be quick; null, with a warning, when the engine lacks something.
    HmiCore::HmiComplexKeyboardEngine* createEngine(QObject* parent) override;
};
