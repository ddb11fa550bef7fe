// SPDX-License-Identifier: MIT
#include "qmlloggers.h"

#include <QLoggingCategory>
#include <QString>

namespace HmiCore {

void writeQmlMessage(const QLoggingCategory& category, LogType type, const QString& message, const QString& file,
                     const QString& function, int line)
{
    const QtMsgType level = type == WarningLog ? QtWarningMsg : QtDebugMsg;
    if (!category.isEnabled(level))
        return;
    const QByteArray fileName = file.toUtf8();
    const QByteArray functionName = function.toUtf8();
    const QByteArray text = message.toLocal8Bit();
    const QMessageLogger logger(fileName.constData(), line, functionName.constData(), category.categoryName());
    if (type == WarningLog)
        logger.warning("%s", text.constData());
    else
        logger.debug("%s", text.constData());
}

} // namespace HmiCore
