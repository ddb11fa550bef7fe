// SPDX-License-Identifier: MIT
#include "probeprocess.h"

#include "probelog.h"

#include <QDir>
#include <QElapsedTimer>
#include <QProcess>
#include <QStringList>
#include <QTemporaryDir>

#include <link.h>
#include <signal.h>

namespace {

constexpr int keptOutput = 4096; // bytes
constexpr int shownLines = 5;
constexpr int pace = 100; // ms between two looks at the output

/// Where this program's libraries lie: its copy, which lies elsewhere, does not find them by itself.
QByteArray libraryPath()
{
    QStringList folders;
    dl_iterate_phdr(
        [](dl_phdr_info* info, size_t, void* data) {
            const QString name = QFile::decodeName(info->dlpi_name);
            const QString folder = name.section(QLatin1Char('/'), 0, -2);
            if (auto* const found = static_cast<QStringList*>(data); !folder.isEmpty() && !found->contains(folder))
                found->append(folder);
            return 0;
        },
        &folders);
    QByteArray path = QFile::encodeName(folders.join(QLatin1Char(':')));
    if (const QByteArray present = qgetenv("LD_LIBRARY_PATH"); !present.isEmpty())
        path += ':' + present;
    return path;
}

QProcessEnvironment environment(const QString& folder)
{
    QProcessEnvironment variables = QProcessEnvironment::systemEnvironment();
    variables.insert(QStringLiteral("LD_LIBRARY_PATH"), QFile::decodeName(libraryPath()));
    variables.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    variables.insert(QStringLiteral("QT_QUICK_BACKEND"), QStringLiteral("software"));
    variables.insert(QStringLiteral("XDG_RUNTIME_DIR"), folder);
    variables.remove(QStringLiteral("QT_LOGGING_RULES"));
    variables.remove(QStringLiteral("QT_FATAL_WARNINGS"));
    return variables;
}

/// The head unit: bin/ with a copy of this program, a plugin directory of each kind with a link to the plugin.
bool layOut(const QDir& base, const QString& plugin, const QString& lists)
{
    const QString name = plugin.section(QLatin1Char('/'), -1);
    bool isDone = QFile::copy(QStringLiteral("/proc/self/exe"), base.filePath(QStringLiteral("bin/probe")))
                  && QFile::setPermissions(base.filePath(QStringLiteral("bin/probe")),
                                           QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    for (const QString& folder : {QStringLiteral("plugins/"), QStringLiteral("inputmethod-plugins/")})
        isDone = isDone && QFile::link(plugin, base.filePath(folder + name));
    if (!lists.isEmpty())
        isDone = isDone && QFile::copy(lists, base.filePath(QStringLiteral("settings/plugins.conf")));
    return isDone;
}

QString lastLines(const QByteArray& output)
{
    const QStringList lines = QString::fromLocal8Bit(output).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    return QStringList(lines.mid(qMax(0, lines.size() - shownLines))).join(QLatin1Char('\n'));
}

/// Waits for the end and keeps the last output; false when the time is over.
bool wait(QProcess* process, int timeLimit, QByteArray* output)
{
    QElapsedTimer elapsed;
    elapsed.start();
    bool isOver = false;
    while (!isOver && elapsed.elapsed() < timeLimit * 1000) {
        isOver = process->waitForFinished(pace);
        *output = (*output + process->readAll()).right(keptOutput);
    }
    return isOver || process->state() == QProcess::NotRunning;
}

} // namespace

ProbeResult runProbe(const QString& plugin, const QString& lists, int timeLimit)
{
    ProbeResult result;
    const QTemporaryDir folder;
    const QDir base(folder.path());
    for (const char* const name : {"bin", "plugins", "inputmethod-plugins", "settings"})
        base.mkpath(QString::fromLatin1(name));
    if (!folder.isValid() || !layOut(base, plugin, lists)) {
        result.error = QStringLiteral("A head unit for the check cannot be laid out in '%1'.").arg(folder.path());
        return result;
    }

    const QString report = base.filePath(QStringLiteral("report"));
    QProcess process;
    process.setProcessEnvironment(environment(folder.path()));
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.setStandardInputFile(QProcess::nullDevice());
    process.start(base.filePath(QStringLiteral("bin/probe")), {QStringLiteral("--probe"), report, plugin});
    if (!process.waitForStarted()) {
        result.error = QStringLiteral("The check cannot be started: %1").arg(process.errorString());
        return result;
    }
    const auto group = pid_t(process.processId());
    QByteArray output;
    const bool isOver = wait(&process, timeLimit, &output);
    ::kill(-group, SIGKILL); // with whatever the plugin started
    if (!isOver) {
        result.end = ProbeResult::Hung;
        process.waitForFinished();
    } else {
        result.end = process.exitStatus() == QProcess::CrashExit ? ProbeResult::Crashed : ProbeResult::Exited;
        result.code = process.exitCode();
    }
    result.lastOutput = lastLines(output);
    result.report = ProbeLog::read(report);
    return result;
}
