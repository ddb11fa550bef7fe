// SPDX-License-Identifier: MIT
#include "intentactiondataprovider.h"

namespace HmiCore {

IntentActionDataProvider::IntentActionDataProvider(QObject* parent)
    : QObject(parent)
{
}

IntentActionDataProvider::~IntentActionDataProvider() = default;

} // namespace HmiCore
