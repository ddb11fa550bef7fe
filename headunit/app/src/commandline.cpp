// SPDX-License-Identifier: MIT
#include "commandline.h"

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QFile>
#include <QRegularExpression>

#include <memory>

namespace {

constexpr int smallestSide = 320;
constexpr int largestSide = 4096;

CommandLine wrong(const QString& message)
{
    CommandLine line;
    line.outcome = CommandLine::Wrong;
    line.message = message;
    return line;
}

/// "WxH" within bounds, or an invalid size.
QSize sizeFrom(const QString& text)
{
    const auto match = QRegularExpression(QStringLiteral("^(\\d{1,5})x(\\d{1,5})$")).match(text);
    const QSize size(match.captured(1).toInt(), match.captured(2).toInt());
    const auto isUsable = [](int side) { return side >= smallestSide && side <= largestSide; };
    return isUsable(size.width()) && isUsable(size.height()) ? size : QSize();
}

/// Qt takes the program's name from the application object, which is not there yet when the program begins.
QString helpText(const QCommandLineParser& parser, const QStringList& arguments)
{
    std::unique_ptr<QCoreApplication> application;
    QByteArray name = QFile::encodeName(arguments.value(0));
    char* argv[] = {name.data(), nullptr};
    int argc = 1;
    if (!QCoreApplication::instance())
        application = std::make_unique<QCoreApplication>(argc, argv);
    return parser.helpText();
}

} // namespace

CommandLine CommandLine::parse(const QStringList& arguments)
{
    const QCommandLineOption vehicle(
        QStringLiteral("vehicle"),
        QStringLiteral("Connect to the vehicle that listens in <dir> instead of the built-in one."),
        QStringLiteral("dir"));
    const QCommandLineOption shot(QStringLiteral("shot"),
                                  QStringLiteral("Draw without a display, write a picture to <file> and exit."),
                                  QStringLiteral("file"));
    const QCommandLineOption view(QStringLiteral("view"), QStringLiteral("Show this view or popup first."),
                                  QStringLiteral("name"));
    const QCommandLineOption size(QStringLiteral("size"), QStringLiteral("Size of the window, 1280x720 by default."),
                                  QStringLiteral("WxH"));
    const QCommandLineOption night(QStringLiteral("night"), QStringLiteral("Use the night colours."));
    const QCommandLineOption listViews(QStringLiteral("list-views"),
                                       QStringLiteral("Print the names of all views and popups."));
    const QCommandLineOption record(QStringLiteral("record"),
                                    QStringLiteral("Write all traffic with the vehicle to <file>."),
                                    QStringLiteral("file"));
    const QCommandLineOption help({QStringLiteral("h"), QStringLiteral("help")}, QStringLiteral("Print this text."));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("The reference head unit."));
    parser.addOptions({vehicle, shot, view, size, night, listViews, record, help});
    if (!parser.parse(arguments))
        return wrong(parser.errorText());
    if (!parser.positionalArguments().isEmpty())
        return wrong(QStringLiteral("Unexpected argument '%1'.").arg(parser.positionalArguments().constFirst()));

    CommandLine line;
    if (parser.isSet(help)) {
        line.outcome = Done;
        line.message = helpText(parser, arguments);
        return line;
    }
    if (parser.isSet(size)) {
        line.size = sizeFrom(parser.value(size));
        if (line.size.isEmpty())
            return wrong(QStringLiteral("'%1' is not a size such as 800x480 (sides from %2 to %3).")
                             .arg(parser.value(size))
                             .arg(smallestSide)
                             .arg(largestSide));
    }
    if (parser.isSet(shot) && parser.value(shot).isEmpty())
        return wrong(QStringLiteral("--shot needs the name of a file."));
    line.vehicleDirectory = parser.value(vehicle);
    line.shotFile = parser.value(shot);
    line.view = parser.value(view);
    line.recordFile = parser.value(record);
    line.night = parser.isSet(night);
    line.listViews = parser.isSet(listViews);
    return line;
}
