// SPDX-License-Identifier: MIT
#include "bridgelog.h"

#include "bridgelimits.h"

namespace AL2HMIBridge {

Q_LOGGING_CATEGORY(bridgeLog, "al2hmi.bridge", QtWarningMsg)

QString shown(const QString& text)
{
    QString result = text.left(shownLength);
    for (QChar& character : result)
        if (!character.isPrint())
            character = QLatin1Char('?');
    return text.size() > shownLength ? result + QStringLiteral("...") : result;
}

} // namespace AL2HMIBridge
