// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <QLoggingCategory>
#include <QTest>

#include <atomic>

namespace {
std::atomic<LogCapture*> active{nullptr};
}

LogCapture::LogCapture(const QString& rules)
{
    Q_ASSERT(!active);
    QLoggingCategory::setFilterRules(rules);
    active = this;
    m_previous = qInstallMessageHandler(&LogCapture::handle);
}

LogCapture::~LogCapture()
{
    qInstallMessageHandler(m_previous);
    active = nullptr;
    QLoggingCategory::setFilterRules(QString());
    const QStringList left = unexpected();
    if (!left.isEmpty())
        QTest::qFail(qPrintable(QStringLiteral("unexpected log lines:\n  ") + left.join(QStringLiteral("\n  "))),
                     __FILE__, __LINE__);
}

void LogCapture::handle(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    LogCapture* const capture = active;
    if (!capture)
        return;
    if (type == QtFatalMsg)
        capture->m_previous(type, context, message);
    const std::lock_guard<std::mutex> lock(capture->m_mutex);
    capture->m_records.append({type, QString::fromLatin1(context.category), message, QString::fromUtf8(context.file),
                               QString::fromUtf8(context.function), context.line});
}

QList<LogCapture::Record> LogCapture::records() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return m_records;
}

QStringList LogCapture::messages(const QString& category, QtMsgType type) const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    QStringList found;
    for (const Record& record : m_records)
        if (record.category == category && record.type == type)
            found.append(record.message);
    return found;
}

QStringList LogCapture::take(const QString& category, QtMsgType type)
{
    const QStringList found = messages(category, type);
    const std::lock_guard<std::mutex> lock(m_mutex);
    for (int i = int(m_records.size()) - 1; i >= 0; --i)
        if (m_records.at(i).category == category && m_records.at(i).type == type)
            m_records.removeAt(i);
    return found;
}

bool LogCapture::takeOne(QtMsgType type, const QString& message)
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    for (int i = 0; i < m_records.size(); ++i) {
        if (m_records.at(i).type == type && m_records.at(i).message == message) {
            m_records.removeAt(i);
            return true;
        }
    }
    return false;
}

QStringList LogCapture::unexpected() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    QStringList found;
    for (const Record& record : m_records)
        if (record.type == QtWarningMsg || record.type == QtCriticalMsg)
            found.append(record.category + QStringLiteral(": ") + record.message);
    return found;
}
