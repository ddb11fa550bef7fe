// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QVector>

QT_BEGIN_NAMESPACE
class QLoggingCategory;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief Level of a message from QML.
enum LogType : int {
    DebugLog = 0,
    WarningLog = 1,
};

/// \brief Arrays nested deeper than this are written as nothing, as are arrays within themselves.
constexpr int deepestArray = 64;

/// \brief Writes a message with its place in QML to a category, unless its level is off there.
///
/// An unknown place is an empty \a file and \a function and line 0.
void writeQmlMessage(const QLoggingCategory& category, LogType type, const QString& message, const QString& file,
                     const QString& function, int line);

/// \brief A global object of QML and the category that it writes to, which must outlive the engine.
struct QmlLoggerDefinition
{
    QString name;
    QLoggingCategory& category;
};

/// \brief Defines the global objects in the engine.
///
/// There are two implementations, of which the build takes one: HmiQmlLogger lives in the engine's own object model,
/// QmlLoggerShim in what Qt publishes of it.
void installQmlLoggers(QQmlEngine* engine, const QVector<QmlLoggerDefinition>& loggers);

} // namespace HmiCore
