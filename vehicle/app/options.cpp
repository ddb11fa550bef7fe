// SPDX-License-Identifier: MIT
#include "options.h"

#include "command.h"

#include <HmiVehicle/vehicledirectory.h>

#include <QCommandLineParser>

using HmiVehicle::Command;

namespace {

bool isCommand(const QString& word)
{
    return word == QLatin1String("send") || word == QLatin1String("play") || Command::isVerb(word);
}

/// Where the command begins; options of its own follow it, but what it consists of is no option.
int commandIndex(const QStringList& arguments)
{
    for (int i = 1; i < arguments.size(); ++i)
        if (isCommand(arguments.at(i)) && arguments.at(i - 1) != QLatin1String("--dir"))
            return i;
    return int(arguments.size());
}

QString helpText(const QCommandLineParser& parser)
{
    return parser.helpText()
           + QStringLiteral("\nCommands to a running vehicle:\n  send COMMAND...\n"
                            "      several commands, each as one argument: send 'key seek_up short'\n")
           + Command::usage()
           + QStringLiteral("\nplay FILE [--hmi PROGRAM [ARGUMENT]...]\n"
                            "  Plays a scenario, or a recording as the other end, and tells what was not as expected.\n"
                            "  Serves by itself when no vehicle does.\n");
}

} // namespace

bool Options::parse(const QStringList& arguments)
{
    QStringList own = arguments;
    const int hmiIndex = int(own.indexOf(QStringLiteral("--hmi")));
    if (hmiIndex > 0) {
        hmi = own.mid(hmiIndex + 1);
        own = own.mid(0, hmiIndex);
    }
    const int index = commandIndex(own);
    const QStringList words = own.mid(index);
    const bool plays = words.value(0) == QLatin1String("play");
    if (!plays)
        own = own.mid(0, index);

    QCommandLineParser parser;
    parser.setApplicationDescription(
        QStringLiteral("A simulated vehicle: the application layer that an HMI connects to."));
    const QCommandLineOption help({QStringLiteral("h"), QStringLiteral("help")}, QStringLiteral("Print this text."));
    const QCommandLineOption directoryOption(QStringLiteral("dir"), QStringLiteral("Directory of the sockets."),
                                             QStringLiteral("directory"), HmiVehicle::VehicleDirectory::defaultPath());
    const QCommandLineOption frozenOption(QStringLiteral("frozen"), QStringLiteral("Let time stand still at 10:42."));
    const QCommandLineOption speedOption(QStringLiteral("speed"),
                                         QStringLiteral("How fast time passes; 0 for on command only."),
                                         QStringLiteral("factor"), QStringLiteral("1"));
    const QCommandLineOption timeoutOption(QStringLiteral("timeout"),
                                           QStringLiteral("How long an expectation is waited for, in milliseconds."),
                                           QStringLiteral("ms"));
    const QCommandLineOption panelOption(QStringLiteral("panel"),
                                         QStringLiteral("Open the control panel: keys, switches, and what goes on."));
    const QCommandLineOption pictureOption(
        QStringLiteral("panel-shot"),
        QStringLiteral("Draw the control panel without a display, write a picture to <file> and exit."),
        QStringLiteral("file"));
    const QCommandLineOption evdevOption(QStringLiteral("evdev"),
                                         QStringLiteral("Take hard keys from this input device; repeatable."),
                                         QStringLiteral("device"));
    const QCommandLineOption keyMapOption(QStringLiteral("keymap"),
                                          QStringLiteral("Which of their keys is which, instead of the shipped map."),
                                          QStringLiteral("file"));
    const QCommandLineOption playerOption(
        QStringLiteral("desktop-player"),
        QStringLiteral("Let a player of the desktop (MPRIS2, session bus) be the media player while there is one."));
    const QCommandLineOption modemOption(
        QStringLiteral("modem"), QStringLiteral("Let the calls of a modem (oFono, system bus) be the phone's calls."));
    parser.addOptions({evdevOption, keyMapOption, playerOption, modemOption});
    parser.addOptions({directoryOption, frozenOption, panelOption, pictureOption, speedOption, timeoutOption, help});
    message = parser.parse(own) ? QString() : parser.errorText();
    if (!message.isEmpty())
        return false;
    if (parser.isSet(help)) {
        task = ShowHelp;
        message = helpText(parser);
        return true;
    }
    directory = parser.value(directoryOption);
    frozen = parser.isSet(frozenOption);
    desktopPlayer = parser.isSet(playerOption);
    modem = parser.isSet(modemOption);
    devices = parser.values(evdevOption);
    keyMap = parser.value(keyMapOption);
    pictureFile = parser.value(pictureOption);
    panel = parser.isSet(panelOption) || !pictureFile.isEmpty();
    bool isSpeed = false;
    speed = parser.value(speedOption).toDouble(&isSpeed);
    if (!isSpeed || !(speed >= 0 && speed <= 1000))
        message = QStringLiteral("'%1' is not a speed from 0 to 1000").arg(parser.value(speedOption));
    bool isTime = true;
    if (parser.isSet(timeoutOption))
        timeout = parser.value(timeoutOption).toInt(&isTime);
    if (!isTime || timeout < -1)
        message = QStringLiteral("'%1' is not a time in milliseconds").arg(parser.value(timeoutOption));
    const QStringList rest = parser.positionalArguments();
    if (plays) {
        task = Play;
        file = rest.value(1);
        if (rest.size() != 2)
            message = QStringLiteral("play needs the name of one file");
    } else if (!rest.isEmpty()) {
        message = QStringLiteral("unexpected argument: ") + rest.constFirst();
    } else if (!words.isEmpty()) {
        task = Send;
        takeCommands(words);
    }
    if (hmiIndex > 0 && (!plays || hmi.isEmpty()))
        message = QStringLiteral("--hmi belongs to play and needs the name of a program");
    if ((!devices.isEmpty() || !keyMap.isEmpty()) && (task != Serve || devices.isEmpty()))
        message = QStringLiteral("--evdev belongs to the vehicle, and --keymap to --evdev");
    if ((desktopPlayer || modem) && task != Serve)
        message = QStringLiteral("--desktop-player and --modem belong to the vehicle, not to its commands");
    if (panel && task != Serve)
        message = QStringLiteral("the control panel belongs to the vehicle, not to its commands");
    return message.isEmpty();
}

void Options::takeCommands(const QStringList& words)
{
    if (words.constFirst() != QLatin1String("send")) {
        commands.push_back(words);
    } else {
        const QStringList texts = words.mid(1);
        for (const QString& text : texts) {
            QStringList split;
            const QString problem = Command::split(text, &split);
            if (!problem.isEmpty())
                message = problem;
            commands.push_back(split);
        }
        if (commands.empty())
            message = QStringLiteral("send needs a command");
    }
    for (const QStringList& command : commands) {
        Command parsed;
        const QString problem = Command::parse(command, &parsed);
        if (!problem.isEmpty() && message.isEmpty())
            message = problem;
    }
}
