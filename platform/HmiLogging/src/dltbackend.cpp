// SPDX-License-Identifier: MIT
#include "dltbackend.h"

#include <QByteArray>
#include <QCoreApplication>
#include <QLoggingCategory>
#include <QMap>

#include <dlt/dlt.h>

#include <fcntl.h>
#include <map>
#include <memory>
#include <mutex>
#include <unistd.h>

namespace HmiLogging {
namespace DltBackend {

namespace {

/// The pipe through which libdlt talks to the daemon.
QByteArray daemonPipe()
{
    const QByteArray folder = qgetenv("DLT_PIPE_DIR");
    return (folder.isEmpty() ? QByteArray("/tmp") : folder) + "/dlt";
}

struct Contexts
{
    std::mutex mutex;
    std::map<QByteArray, std::unique_ptr<DltContext>> byCategory;
    std::map<QByteArray, QByteArray> categoryById;
};

Contexts& contexts()
{
    static Contexts instance;
    return instance;
}

/// A pipe that nobody reads refuses to be opened for writing.
bool daemonReads()
{
    const int fd = ::open(daemonPipe().constData(), O_WRONLY | O_NONBLOCK | O_CLOEXEC);
    if (fd < 0)
        return false;
    ::close(fd);
    return true;
}

DltLogLevelType levelOf(QtMsgType type)
{
    switch (type) {
    case QtDebugMsg:
        return DLT_LOG_DEBUG;
    case QtInfoMsg:
        return DLT_LOG_INFO;
    case QtWarningMsg:
        return DLT_LOG_WARN;
    case QtCriticalMsg:
        return DLT_LOG_ERROR;
    case QtFatalMsg:
        return DLT_LOG_FATAL;
    }
    return DLT_LOG_INFO;
}

/// Runs on the main thread: what the daemon asked for, of every category so far, becomes Qt's filter rules.
void applyLevel(const QByteArray& category, int level)
{
    static QMap<QByteArray, int> wanted;
    wanted[category] = level;
    QString rules;
    for (auto it = wanted.constBegin(); it != wanted.constEnd(); ++it) {
        const QString name = QString::fromLatin1(it.key());
        const auto rule = [&](const char* suffix, int needed) {
            rules += QStringLiteral("%1.%2=%3\n")
                         .arg(name, QLatin1String(suffix),
                              it.value() >= needed ? QStringLiteral("true") : QStringLiteral("false"));
        };
        rule("debug", DLT_LOG_DEBUG);
        rule("info", DLT_LOG_INFO);
        rule("warning", DLT_LOG_WARN);
        rule("critical", DLT_LOG_ERROR);
    }
    QLoggingCategory::setFilterRules(rules);
}

/// Called by libdlt on its own thread.
void levelChanged(char contextId[DLT_ID_SIZE], uint8_t level, uint8_t)
{
    QByteArray category;
    {
        const std::lock_guard<std::mutex> lock(contexts().mutex);
        category = contexts().categoryById[QByteArray(contextId, DLT_ID_SIZE)];
    }
    if (category.isEmpty() || !QCoreApplication::instance())
        return;
    QMetaObject::invokeMethod(
        QCoreApplication::instance(), [category, level] { applyLevel(category, level); }, Qt::QueuedConnection);
}

/// One DLT context per category; ids are numbered because names do not fit into four characters.
DltContext* contextOf(const char* name)
{
    Contexts& known = contexts();
    const QByteArray category(name ? name : "default");
    std::unique_lock<std::mutex> lock(known.mutex);
    auto& context = known.byCategory[category];
    if (context)
        return context.get();
    context = std::make_unique<DltContext>();
    const QByteArray id = "C" + QByteArray::number(int(known.byCategory.size())).rightJustified(3, '0');
    known.categoryById[id] = category;
    DltContext* const created = context.get();
    lock.unlock(); // libdlt may call levelChanged() from within
    dlt_register_context(created, id.constData(), category.constData());
    dlt_register_log_level_changed_callback(created, levelChanged);
    return created;
}

} // namespace

bool start(const QByteArray& applicationId)
{
    if (!daemonReads())
        return false;
    dlt_set_resend_timeout_atexit(0);
    return dlt_register_app(applicationId.left(DLT_ID_SIZE).constData(), applicationId.constData()) >= DLT_RETURN_OK;
}

void write(QtMsgType type, const char* category, const QString& message)
{
    DltContextData data;
    if (dlt_user_log_write_start(contextOf(category), &data, levelOf(type)) != DLT_RETURN_TRUE)
        return;
    dlt_user_log_write_utf8_string(&data, message.toUtf8().constData());
    dlt_user_log_write_finish(&data);
}

void stop()
{
    dlt_unregister_app();
    dlt_free();
    const std::lock_guard<std::mutex> lock(contexts().mutex);
    contexts().byCategory.clear();
    contexts().categoryById.clear();
}

} // namespace DltBackend
} // namespace HmiLogging
