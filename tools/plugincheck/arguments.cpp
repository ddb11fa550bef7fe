// SPDX-License-Identifier: MIT
#include "arguments.h"

#include <QCommandLineParser>
#include <QFileInfo>

#include <utility>

namespace {

constexpr int longestTime = 3600; // s

const char* const description =
    "Tells what a plugin offers to the head unit, or why the head unit cannot use it.\n\n"
    "The plugin is loaded by a head unit of its own, in a process of its own: it may crash, throw or hang.\n"
    "Exit code: 0 the plugin can be used, 1 it cannot, 2 the command line is wrong.";

Arguments wrong(const QString& message)
{
    Arguments arguments;
    arguments.outcome = Arguments::Wrong;
    arguments.message = message;
    return arguments;
}

QString problemOf(const QString& fileName)
{
    const QFileInfo file(fileName);
    if (!file.exists())
        return QStringLiteral("There is no file '%1'.").arg(fileName);
    if (!file.isFile())
        return QStringLiteral("'%1' is not a regular file.").arg(fileName);
    if (!file.isReadable())
        return QStringLiteral("'%1' cannot be read.").arg(fileName);
    return QString();
}

} // namespace

Arguments Arguments::parse(const QStringList& commandLine)
{
    const QCommandLineOption lists(QStringLiteral("lists"),
                                   QStringLiteral("Apply the black and white list of this <plugins.conf>."),
                                   QStringLiteral("plugins.conf"));
    const QCommandLineOption time(QStringLiteral("timeout"),
                                  QStringLiteral("Call the plugin hung after <seconds>, 20 by default."),
                                  QStringLiteral("seconds"));
    const QCommandLineOption json(QStringLiteral("json"), QStringLiteral("Report as JSON."));
    const QCommandLineOption strict(QStringLiteral("strict"),
                                    QStringLiteral("Problems that the head unit lives with count as well."));
    const QCommandLineOption help({QStringLiteral("h"), QStringLiteral("help")}, QStringLiteral("Print this text."));

    QCommandLineParser parser;
    parser.setApplicationDescription(QString::fromLatin1(description));
    parser.addOptions({lists, time, json, strict, help});
    parser.addPositionalArgument(QStringLiteral("plugin.so"), QStringLiteral("The plugin."));
    if (!parser.parse(commandLine))
        return wrong(parser.errorText());

    Arguments arguments;
    if (parser.isSet(help)) {
        arguments.outcome = Done;
        arguments.message = parser.helpText();
        return arguments;
    }
    if (parser.positionalArguments().size() != 1)
        return wrong(QStringLiteral("Name one plugin."));
    QStringList files = parser.positionalArguments();
    if (parser.isSet(lists))
        files += parser.value(lists);
    for (const QString& file : std::as_const(files))
        if (const QString problem = problemOf(file); !problem.isEmpty())
            return wrong(problem);
    if (parser.isSet(time)) {
        bool isNumber = false;
        arguments.timeLimit = parser.value(time).toInt(&isNumber);
        if (!isNumber || arguments.timeLimit < 1 || arguments.timeLimit > longestTime)
            return wrong(QStringLiteral("--timeout needs a number of seconds from 1 to %1, not '%2'.")
                             .arg(longestTime)
                             .arg(parser.value(time)));
    }
    arguments.file = QFileInfo(files.constFirst()).absoluteFilePath();
    if (parser.isSet(lists))
        arguments.lists = QFileInfo(files.constLast()).absoluteFilePath();
    arguments.json = parser.isSet(json);
    arguments.strict = parser.isSet(strict);
    return arguments;
}
