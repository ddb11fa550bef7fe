// SPDX-License-Identifier: MIT
#include "hmiintenthandler.h"

namespace HmiCore {

HmiIntentHandler::HmiIntentHandler(QObject* parent)
    : QObject(parent)
{
}

HmiIntentHandler::~HmiIntentHandler() = default;

bool HmiIntentHandler::isActionEnabled(int intent) const
{
    return m_actions.contains(intent);
}

QString HmiIntentHandler::lastError() const
{
    return QStringLiteral("No Error");
}

QList<int> HmiIntentHandler::handledActions() const
{
    return m_actions;
}

void HmiIntentHandler::addAction(int intent)
{
    m_actions.append(intent);
}

} // namespace HmiCore
