// SPDX-License-Identifier: MIT
#include "commandline.h"

#include "keyboard.h"

#include <HmiVehicle/languages.h>

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
    return parser.helpText() + QStringLiteral("\nKeys of the keyboard that are hard keys of the vehicle:\n")
           + Keyboard::help();
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
    const QCommandLineOption tour(QStringLiteral("tour"),
                                  QStringLiteral("Lead through the head unit by the steps of <file>, and exit with 0 "
                                                 "when the screens show what they should."),
                                  QStringLiteral("file"));
    const QCommandLineOption pictures(
        QStringLiteral("pictures"), QStringLiteral("Draw the tour without a display, and write its pictures to <dir>."),
        QStringLiteral("dir"));
    const QCommandLineOption startupReport(
        QStringLiteral("startup-report"),
        QStringLiteral(
            "Start, tell what took how long until the first frame, draw that into <file> (SVG) and into a trace "
            "beside it (.json), and exit."),
        QStringLiteral("file"));
    const QCommandLineOption country(
        QStringLiteral("country"),
        QStringLiteral("Country of the built-in vehicle, as markets/config.json writes it, such as 114 for Germany."),
        QStringLiteral("code"));
    const QCommandLineOption language(QStringLiteral("language"),
                                      QStringLiteral("Language of the built-in vehicle, such as de_DE."),
                                      QStringLiteral("locale"));
    const QCommandLineOption help({QStringLiteral("h"), QStringLiteral("help")}, QStringLiteral("Print this text."));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("The reference head unit."));
    parser.addOptions(
        {vehicle, shot, view, size, night, listViews, tour, pictures, startupReport, record, country, language, help});
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
    line.startupReport = parser.value(startupReport);
    if (parser.isSet(startupReport)
        && (!line.startupReport.endsWith(QLatin1String(".svg")) || parser.isSet(shot) || parser.isSet(tour)
            || parser.isSet(view)))
        return wrong(
            QStringLiteral("--startup-report needs a file that ends in .svg, and shows the start screen only."));
    line.tourFile = parser.value(tour);
    line.pictures = parser.value(pictures);
    if (!line.tourFile.isEmpty() && parser.isSet(vehicle))
        return wrong(QStringLiteral("--tour drives the built-in vehicle, and so cannot be used with --vehicle."));
    if (line.tourFile.isEmpty() && parser.isSet(pictures))
        return wrong(QStringLiteral("--pictures is for --tour."));
    bool isCountry = true;
    if (parser.isSet(country))
        line.country = parser.value(country).toInt(&isCountry, 16);
    if (!isCountry || line.country < -1)
        return wrong(QStringLiteral("'%1' is not the hexadecimal code of a country.").arg(parser.value(country)));
    if (parser.isSet(language)) {
        line.language = HmiVehicle::languageFromLocale(parser.value(language));
        if (line.language < 0)
            return wrong(
                QStringLiteral("'%1' is not the locale of a language, such as de_DE.").arg(parser.value(language)));
    }
    if (parser.isSet(vehicle) && (parser.isSet(country) || parser.isSet(language)))
        return wrong(QStringLiteral("--country and --language are for the built-in vehicle; another one has its own."));
    line.vehicleDirectory = parser.value(vehicle);
    line.shotFile = parser.value(shot);
    line.view = parser.value(view);
    line.recordFile = parser.value(record);
    line.night = parser.isSet(night);
    line.listViews = parser.isSet(listViews);
    return line;
}
