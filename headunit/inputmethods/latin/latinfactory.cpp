// SPDX-License-Identifier: MIT
#include "latinfactory.h"

#include "latinrecognizer.h"

namespace Latin {

LatinFactory::LatinFactory(QObject* parent)
    : HmiHandwritingRecognizerFactory(parent)
{
}

HmiCore::HmiHandwritingRecognizer* LatinFactory::createRecognizer(QObject* parent)
{
    auto* const recognizer = new LatinRecognizer(parent);
    recognizer->processStrokes(); // ready by the time of the first stroke
    return recognizer;
}

} // namespace Latin
