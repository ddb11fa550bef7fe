// SPDX-License-Identifier: MIT
// Tells what a plugin offers to the head unit, or why the head unit cannot use it.
#include "arguments.h"
#include "diagnosis.h"
#include "probe.h"
#include "textreport.h"

#include <QCoreApplication>
#include <QJsonDocument>
#include <QTextStream>

#include <cstring>

namespace {

constexpr int unusable = 1;
constexpr int wrongUsage = 2;

} // namespace

int main(int argc, char** argv)
{
    // How this program starts itself, see ProbeProcess.
    if (argc == 4 && std::strcmp(argv[1], "--probe") == 0)
        return Probe::run(argc, argv, QString::fromLocal8Bit(argv[2]), QString::fromLocal8Bit(argv[3]));

    const QCoreApplication application(argc, argv);
    const Arguments arguments = Arguments::parse(QCoreApplication::arguments());
    if (arguments.outcome != Arguments::Run) {
        const bool isWrong = arguments.outcome == Arguments::Wrong;
        QTextStream(isWrong ? stderr : stdout)
            << (isWrong ? QStringLiteral("hmi-plugin-check: ") : QString()) << arguments.message << '\n';
        return isWrong ? wrongUsage : EXIT_SUCCESS;
    }
    const Diagnosis diagnosis = Diagnosis::of(arguments);
    QTextStream output(stdout);
    if (arguments.json)
        output << QString::fromUtf8(QJsonDocument(diagnosis.toJson()).toJson());
    else
        output << textReport(diagnosis);
    return diagnosis.isGood(arguments.strict) ? EXIT_SUCCESS : unusable;
}
