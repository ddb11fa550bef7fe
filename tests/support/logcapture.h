// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QMessageLogContext>
#include <QString>
#include <QStringList>

#include <mutex>

/// \brief Collects all log lines of a test function; lines of warning level and above that nobody took fail the test.
///
/// Make one in the test's init() (QtTest puts its own handler in place when a function starts) and destroy it in
/// cleanup(). Thread-safe. One at a time.
class LogCapture
{
public:
    struct Record
    {
        QtMsgType type;
        QString category;
        QString message;
        QString file;
        QString function;
        int line;
    };

    /// \a rules are QLoggingCategory filter rules for the life of the capture, such as "kest.hmicore.debug=true".
    explicit LogCapture(const QString& rules = QString());
    ~LogCapture();
    Q_DISABLE_COPY(LogCapture)

    /// Everything captured since construction or the last take(), oldest first.
    QList<Record> records() const;

    /// The messages of one category and type, oldest first.
    QStringList messages(const QString& category, QtMsgType type) const;

    /// As messages(), and forgets them, so that warnings among them count as expected.
    QStringList take(const QString& category, QtMsgType type);

    /// Removes the first record whose type is \a type and whose message is exactly \a message; false when there is none.
    bool takeOne(QtMsgType type, const QString& message);

    /// Records of warning level and above that are still there, as "category: message".
    QStringList unexpected() const;

private:
    static void handle(QtMsgType type, const QMessageLogContext& context, const QString& message);

    mutable std::mutex m_mutex;
    QList<Record> m_records;
    QtMessageHandler m_previous;
};
