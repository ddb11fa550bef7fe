// SPDX-License-Identifier: MIT
#include "headunitlayout.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QProcessEnvironment>
#include <QTest>

namespace {

void copy(const QString& from, const QString& to)
{
    if (!QFile::copy(from, to))
        qFatal("cannot copy %s to %s", qPrintable(from), qPrintable(to));
}

} // namespace

HeadUnitLayout::HeadUnitLayout(const QString& programDirectory)
{
    makeDirectory(programDirectory);
    m_program = QDir::cleanPath(path(programDirectory) + QStringLiteral("/headlesshmi"));
    copy(QStringLiteral(HEADLESS_HMI), m_program);
    writeFile(QStringLiteral("views/Main.qml"), "import QtQuick 2.0\nItem {}\n");
    writeFile(QStringLiteral("views/module.json"),
              "{ \"version\": 1, \"views\": [ { \"name\": \"Main\", \"url\": \"Main.qml\" } ] }");
    writeFile(QStringLiteral("views/root.json"),
              "{ \"version\": 1, \"popups\": [ { \"name\": \"Call\", \"url\": \"Main.qml\" } ] }");
}

void HeadUnitLayout::addPlugins(const QString& directory, const QStringList& names)
{
    makeDirectory(directory);
    for (const QString& name : names) {
        const QString file = name + QStringLiteral(".so");
        copy(QStringLiteral(FIXTURE_PLUGINS "/") + file, path(directory + QLatin1Char('/') + file));
    }
}

void HeadUnitLayout::makeDirectory(const QString& directory)
{
    if (!QDir().mkpath(path(directory)))
        qFatal("cannot make %s", qPrintable(path(directory)));
}

void HeadUnitLayout::writeFile(const QString& relative, const QByteArray& content)
{
    makeDirectory(QFileInfo(relative).path());
    QFile file(path(relative));
    if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
        qFatal("cannot write %s", qPrintable(file.fileName()));
}

QStringList HeadUnitLayout::filesIn(const QString& directory) const
{
    return QDir(path(directory)).entryList(QDir::Files, QDir::Unsorted);
}

bool HeadUnitLayout::run(const QStringList& arguments)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("QT_LOGGING_RULES"),
                       QStringLiteral("kest.hmicore.debug=true;hmi.performance.debug=true;hmi.trace.debug=true"));
    environment.insert(QStringLiteral("HMI_BRIDGE_DIR"), path(QStringLiteral("nobody")));
    environment.insert(QStringLiteral("XDG_RUNTIME_DIR"), m_directory.path()); // owner only, as Qt wants it
    QProcess process;
    process.setProcessEnvironment(environment);
    process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    QStringList command = QStringLiteral(EMULATOR).split(QLatin1Char('|'), Qt::SkipEmptyParts);
    command << m_program << arguments;
    process.start(command.takeFirst(), command);
    if (!process.waitForFinished(60000)) {
        m_error = process.errorString();
        process.kill();
        process.waitForFinished();
        return false;
    }
    m_lines = QString::fromUtf8(process.readAllStandardOutput()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    if (process.exitStatus() == QProcess::NormalExit && process.exitCode() == 0)
        return true;
    m_error = QStringLiteral("status %1, code %2, last line: %3")
                  .arg(process.exitStatus())
                  .arg(process.exitCode())
                  .arg(m_lines.value(m_lines.size() - 1));
    return false;
}

QStringList HeadUnitLayout::coreLines() const
{
    QStringList found;
    for (const QString& line : m_lines) {
        const QString category = line.section(QLatin1Char(' '), 1, 1);
        if (category != QStringLiteral("kest.hmicore:") && category != QStringLiteral("default:"))
            continue;
        const QString message = line.section(QLatin1Char(' '), 2);
        found += line.startsWith(QLatin1Char('D')) ? message : line.left(2) + message;
    }
    while (!found.isEmpty() && !found.first().startsWith(QStringLiteral("Looking for plugins in:")))
        found.removeFirst();
    return found;
}
