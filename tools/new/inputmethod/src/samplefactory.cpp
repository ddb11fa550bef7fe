// SPDX-License-Identifier: MIT
#include "samplefactory.h"

#include "sampleengine.h"

SampleFactory::SampleFactory()
    : HmiComplexKeyboardEngineFactory(nullptr)
{
}

HmiCore::HmiComplexKeyboardEngine* SampleFactory::createEngine(QObject* parent)
{
    return new SampleEngine(parent);
}
