// SPDX-License-Identifier: MIT
#include "languagepropertyparser.h"

#include "jsonfile.h"
#include "languagebundlesfolder.h"
#include "logcategories.h"

#include <QJsonArray>
#include <QJsonObject>

namespace HmiCore {

QHash<QPair<QString, QString>, QMap<QString, QVariant>> LanguagePropertyParser::parse(const QString& fileName,
                                                                                      const QString& directory)
{
    QHash<QPair<QString, QString>, QMap<QString, QVariant>> stores;
    const JsonFile file = JsonFile::read(languageBundlesPath(fileName, directory));
    switch (file.outcome) {
    case JsonFile::Read:
        break;
    case JsonFile::Missing:
        qCWarning(coreLog) << Q_FUNC_INFO << "Invalid language properties file path:" << fileName;
        break;
    case JsonFile::Unreadable:
        qCWarning(coreLog) << Q_FUNC_INFO << "Could not read language properties file:" << fileName;
        break;
    case JsonFile::Malformed:
        qCWarning(coreLog) << Q_FUNC_INFO << "Invalid json in language properties file:" << fileName;
        break;
    }

    const QJsonArray elements = file.document.array();
    for (const QJsonValue& element : elements) {
        const QJsonObject object = element.toObject();
        const auto bundleId = object.constFind(QLatin1String("bundleId"));
        const auto locale = object.constFind(QLatin1String("locale"));
        const auto properties = object.constFind(QLatin1String("properties"));
        if (bundleId == object.constEnd() || locale == object.constEnd() || properties == object.constEnd())
            continue;
        stores.insert(qMakePair(bundleId->toString(), locale->toString()), properties->toObject().toVariantMap());
    }
    return stores;
}

} // namespace HmiCore
