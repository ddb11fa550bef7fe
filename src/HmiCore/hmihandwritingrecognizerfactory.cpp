// SPDX-License-Identifier: MIT
#include "hmihandwritingrecognizerfactory.h"

namespace HmiCore {

HmiHandwritingRecognizerFactory::HmiHandwritingRecognizerFactory(QObject* parent)
    : QObject(parent)
{
}

HmiHandwritingRecognizerFactory::~HmiHandwritingRecognizerFactory() = default;

} // namespace HmiCore
