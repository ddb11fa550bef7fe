// SPDX-License-Identifier: MIT
#include "languagepackparser.h"

#include "jsonfile.h"
#include "languagebundlesfolder.h"
#include "logcategories.h"

#include <QJsonArray>
#include <QJsonObject>

namespace HmiCore {

namespace {

HmiLanguagePackCollection::LanguageBundle bundleOf(const QJsonObject& object)
{
    HmiLanguagePackCollection::LanguageBundle bundle;
    const auto policy = object.constFind(QLatin1String("orderingPolicy"));
    bundle.orderingPolicy = policy == object.constEnd()
                                ? HmiLanguagePackCollection::NameOrder
                                : HmiLanguagePackCollection::orderPolicyFromString(policy->toString());
    const QJsonArray locales = object.value(QLatin1String("locales")).toArray();
    for (const QJsonValue& locale : locales)
        bundle.locales.append(locale.toString());
    bundle.defaultLocale = object.value(QLatin1String("default")).toString();
    if (bundle.defaultLocale.isEmpty())
        bundle.defaultLocale = bundle.locales.value(0);
    return bundle;
}

} // namespace

QMap<QString, HmiLanguagePackCollection::LanguageBundle> LanguagePackParser::parse(const QString& fileName,
                                                                                   const QString& directory)
{
    QMap<QString, HmiLanguagePackCollection::LanguageBundle> bundles;
    const JsonFile file = JsonFile::read(languageBundlesPath(fileName, directory));
    switch (file.outcome) {
    case JsonFile::Read:
        break;
    case JsonFile::Missing:
        qCWarning(coreLog) << Q_FUNC_INFO << "Invalid language bundle config file path:" << fileName;
        break;
    case JsonFile::Unreadable:
        qCWarning(coreLog) << Q_FUNC_INFO << "Could not read language bundle config file:" << fileName;
        break;
    case JsonFile::Malformed:
        qCWarning(coreLog) << Q_FUNC_INFO << "Invalid json in language bundle config file:" << fileName;
        break;
    }

    bool isFallbackDecided = false;
    const QJsonArray elements = file.document.array();
    for (const QJsonValue& element : elements) {
        const QJsonObject object = element.toObject();
        const auto id = object.constFind(QLatin1String("bundleId"));
        if (id == object.constEnd())
            continue;
        HmiLanguagePackCollection::LanguageBundle bundle = bundleOf(object);
        const auto fallback = object.constFind(QLatin1String("fallbackBundle"));
        if (!isFallbackDecided && fallback != object.constEnd()) {
            bundle.isFallback = fallback->toBool();
            isFallbackDecided = true; // also by an element that is dropped, and by a "no"
        }
        if (object.contains(QLatin1String("locales")))
            bundles.insert(id->toString(), bundle);
    }
    return bundles;
}

} // namespace HmiCore
