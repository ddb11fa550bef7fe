// SPDX-License-Identifier: MIT
// Describes the QML modules of the reference head unit and its modules: describe-headunit DIR PLUGIN...
#include "productinitializer.h"
#include "registeredtypes.h"

#include <HmiCore/HmiModuleIntegration>
#include <HmiCore/ModuleInterface>

#include <QCoreApplication>
#include <QJsonArray>
#include <QJsonObject>
#include <QPluginLoader>

#include <cstdio>

namespace {

bool registerTypesOf(const QString& plugin, QObject* parent, QString* error)
{
    QPluginLoader loader(plugin);
    auto* const module = qobject_cast<HmiCore::ModuleInterface*>(loader.instance());
    if (!module) {
        *error = QStringLiteral("%1 is no module: %2").arg(plugin, loader.errorString());
        return false;
    }
    const QJsonObject metaData = loader.metaData().value(QLatin1String("MetaData")).toObject();
    const QJsonArray keys = metaData.value(QLatin1String("Keys")).toArray();
    for (const auto& key : keys) {
        if (auto* const integration = module->createModuleIntegration(key.toString(), parent))
            integration->registerTypes();
    }
    return true;
}

} // namespace

int main(int argc, char* argv[])
{
    const QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() < 2) {
        fputs("usage: describe-headunit DIR PLUGIN...\n", stderr);
        return 2;
    }
    QString error;
    QObject modules;
    ProductInitializer(false).registerQmlTypes();
    bool done = true;
    for (int i = 2; done && i < arguments.size(); ++i)
        done = registerTypesOf(arguments.at(i), &modules, &error);
    const QStringList names{QStringLiteral("HeadUnit.Input"), QStringLiteral("HmiApps"), QStringLiteral("HmiClimate"),
                            QStringLiteral("HmiNavigation")};
    if (done && writeDescriptions(arguments.at(1), names, &error))
        return 0;
    fprintf(stderr, "describe-headunit: %s\n", qPrintable(error));
    return 1;
}
