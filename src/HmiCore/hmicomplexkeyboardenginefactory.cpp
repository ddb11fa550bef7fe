// SPDX-License-Identifier: MIT
#include "hmicomplexkeyboardenginefactory.h"

namespace HmiCore {

HmiComplexKeyboardEngineFactory::HmiComplexKeyboardEngineFactory(QObject* parent)
    : QObject(parent)
{
}

HmiComplexKeyboardEngineFactory::~HmiComplexKeyboardEngineFactory() = default;

} // namespace HmiCore
