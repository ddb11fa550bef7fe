// SPDX-License-Identifier: MIT
// Describes the QML modules of the core to editors and linters: describe-core DIR
#include "registeredtypes.h"

#include <HmiCore/hmicore.h>

#include <QCoreApplication>

#include <cstdio>

int main(int argc, char* argv[])
{
    const QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() != 2) {
        fputs("usage: describe-core DIR\n", stderr);
        return 2;
    }
    HmiCore::registerTypes();
    QString error;
    const QStringList modules{QStringLiteral("HmiCore"), QStringLiteral("HmiIntents"), QStringLiteral("HmiOverrides")};
    if (writeDescriptions(arguments.at(1), modules, &error))
        return 0;
    fprintf(stderr, "describe-core: %s\n", qPrintable(error));
    return 1;
}
