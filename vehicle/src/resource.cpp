// SPDX-License-Identifier: MIT
#include "resource.h"

#include <QFile>
#include <QJsonDocument>

static void registerResources()
{
    Q_INIT_RESOURCE(vehicletable); // a static library's resources are not registered by themselves
}

namespace HmiVehicle {

QJsonObject readResource(const QString& fileName)
{
    registerResources();
    QFile file(fileName);
    QJsonObject content;
    if (file.open(QIODevice::ReadOnly))
        content = QJsonDocument::fromJson(file.readAll()).object();
    if (content.isEmpty())
        qFatal("%s is not in the program", qPrintable(fileName));
    return content;
}

} // namespace HmiVehicle
