// SPDX-License-Identifier: MIT
#pragma once

#include <QJSValue>
#include <QObject>

QT_BEGIN_NAMESPACE
class QLoggingCategory;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief The part of a QML logger that is not JavaScript, for builds without Qt's private headers.
///
/// A small script makes the message and hands it over with the text of the JavaScript stack, whose second line names
/// the caller. Engine's thread only.
class QmlLoggerShim : public QObject
{
    Q_OBJECT

public:
    /// \brief The category is not owned and must outlive the shim.
    QmlLoggerShim(QLoggingCategory& category, QObject* parent);

    /// \brief Whether messages of a LogType are wanted; spares making the stack.
    Q_INVOKABLE bool isEnabled(int type) const;

    /// \brief Writes a message; \a stack is what `new Error().stack` gave in the method called by QML.
    Q_INVOKABLE void write(int type, const QString& message, const QString& stack) const;

private:
    QLoggingCategory& m_category;
};

} // namespace HmiCore
