// SPDX-License-Identifier: MIT
// From the start of a process to its first frame, with 3, 50 and 200 module plugins, against a bare QML window; and the
// loading of the plugins against what the files cost by hand.
#include "table.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <chrono>
#include <utility>

namespace {

constexpr int runs = 21;

void write(const QString& fileName, const QByteArray& content)
{
    QFile file(fileName);
    if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
        qFatal("cannot write %s", qPrintable(fileName));
}

void copy(const QString& from, const QString& to)
{
    if (!QFile::copy(from, to)) // a copy of its own: the dynamic linker takes links for one and the same library
        qFatal("cannot copy %s to %s", qPrintable(from), qPrintable(to));
}

/// What a process prints: microseconds.
double measured(const QString& program, const QString& argument)
{
    QProcess process;
    process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    const auto start = std::chrono::steady_clock::now().time_since_epoch();
    const auto nanoseconds = std::chrono::duration_cast<std::chrono::nanoseconds>(start).count();
    process.start(program, {QString::number(nanoseconds), argument});
    if (!process.waitForFinished(60000) || process.exitCode() != 0)
        qFatal("%s failed", qPrintable(program));
    return process.readAllStandardOutput().trimmed().toDouble();
}

/// Two programs that run in turns, so that a busy machine slows both.
std::pair<Samples, Samples> compared(const QString& first, const QString& firstArgument, const QString& second,
                                     const QString& secondArgument)
{
    std::vector<double> firstTimes;
    std::vector<double> secondTimes;
    for (int run = 0; run < runs; ++run) {
        firstTimes.push_back(measured(first, firstArgument));
        secondTimes.push_back(measured(second, secondArgument));
    }
    return {firstTimes, secondTimes};
}

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication app(argc, argv);
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("QT_QUICK_BACKEND", "software");
    const QTemporaryDir base;
    qputenv("HMI_BRIDGE_DIR", QFile::encodeName(base.filePath(QStringLiteral("nobody"))));
    qputenv("XDG_RUNTIME_DIR", QFile::encodeName(base.path()));
    for (const char* const directory : {"bin", "plugins", "views"})
        QDir(base.path()).mkdir(QString::fromLatin1(directory));
    const QString screen = base.filePath(QStringLiteral("views/Main.qml"));
    write(screen, "import QtQuick 2.0\nRectangle { color: \"navy\"; Text { text: \"Start\"; color: \"white\" } }\n");
    write(base.filePath(QStringLiteral("views/module.json")),
          "{ \"version\": 1, \"views\": [ { \"name\": \"Main\", \"url\": \"Main.qml\" } ] }");
    const QString hmi = base.filePath(QStringLiteral("bin/hmi"));
    copy(QStringLiteral(HMI), hmi);

    int present = 0;
    for (const int modules : {3, 50, 200}) {
        for (; present < modules; ++present)
            copy(QStringLiteral(MODULE), base.filePath(QStringLiteral("plugins/module%1.so").arg(present)));
        char operation[80];
        const auto [whole, bare] = compared(hmi, QStringLiteral("frame"), QStringLiteral(BARE), screen);
        const auto [loading, byHand] = compared(hmi, QStringLiteral("plugins"), hmi, QStringLiteral("dlopen"));
        if (modules == 3) {
            Table::row("start to first screen, 3 modules / bare window", whole, bare, 1.15);
        } else {
            std::snprintf(operation, sizeof operation, "start to first screen, %d modules / bare window + dlopen",
                          modules);
            Table::row(operation, whole, bare.scaled(1, byHand.median()));
        }
        std::snprintf(operation, sizeof operation, "loading %d plugins / metadata, dlopen and instance", modules);
        Table::row(operation, loading, byHand, 1.3);
    }
}
