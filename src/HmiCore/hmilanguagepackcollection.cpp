// SPDX-License-Identifier: MIT
#include "hmilanguagepackcollection.h"

#include "hmimarketpropertystore.h"
#include "languagebundlesfolder.h"
#include "languagepackparser.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/LanguageModel>

#include <QCoreApplication>

using AL2HMIBridge::GlobalSource;
using AL2HMIBridge::LanguageModel;

namespace HmiCore {

HmiLanguagePackCollection* HmiLanguagePackCollection::instance()
{
    static auto* const collection = new HmiLanguagePackCollection(QCoreApplication::instance());
    return collection;
}

HmiLanguagePackCollection::HmiLanguagePackCollection(QObject* parent)
    : QObject(parent)
    , m_bundles(LanguagePackParser().parse(QStringLiteral("config.json"), languageBundlesFolder()))
{
    for (auto bundle = m_bundles.constBegin(); bundle != m_bundles.constEnd(); ++bundle) {
        if (!bundle->isFallback)
            continue;
        m_fallbackBundleId = bundle.key();
        break;
    }
}

HmiLanguagePackCollection::~HmiLanguagePackCollection() = default;

bool HmiLanguagePackCollection::inBundle(const QString& bundleId, const QString& locale) const
{
    const auto bundle = m_bundles.constFind(bundleId);
    return bundle != m_bundles.constEnd() && bundle->locales.contains(locale);
}

bool HmiLanguagePackCollection::supported(int languageId) const
{
    const auto language = static_cast<GlobalSource::SystemLanguage>(languageId);
    const LanguageModel* const languages = LanguageModel::instance();
    if (!languages->languageSupported(language))
        return false;
    const int country = GlobalSource::instance()->destinationCountry();
    const QVariant bundleId =
        HmiMarketPropertyStore::instance()->getProperty(country, QStringLiteral("languageBundle"));
    return inBundle(bundleId.toString(), languages->localeFromId(language));
}

HmiLanguagePackCollection::OrderingPolicy HmiLanguagePackCollection::policyForBundle(const QString& bundleId) const
{
    const auto bundle = m_bundles.constFind(bundleId);
    return bundle == m_bundles.constEnd() ? InvalidOrder : bundle->orderingPolicy;
}

int HmiLanguagePackCollection::indexInBundle(const QString& bundleId, const QString& locale) const
{
    const auto bundle = m_bundles.constFind(bundleId);
    return bundle == m_bundles.constEnd() ? -1 : int(bundle->locales.indexOf(locale));
}

QString HmiLanguagePackCollection::defaultForBundle(const QString& bundleId) const
{
    return m_bundles.value(bundleId).defaultLocale;
}

QString HmiLanguagePackCollection::fallbackBundleId() const
{
    return m_fallbackBundleId;
}

QStringList HmiLanguagePackCollection::bundles() const
{
    return m_bundles.keys();
}

QStringList HmiLanguagePackCollection::bundleLocales(const QString& bundleId) const
{
    return m_bundles.value(bundleId).locales;
}

QList<int> HmiLanguagePackCollection::bundleLanguageIds(const QString& bundleId) const
{
    QList<int> ids;
    const QStringList locales = bundleLocales(bundleId);
    for (const QString& locale : locales)
        ids.append(LanguageModel::instance()->idForLocale(locale));
    return ids;
}

HmiLanguagePackCollection::OrderingPolicy HmiLanguagePackCollection::orderPolicyFromString(const QString& text)
{
    if (text.compare(QLatin1String("NameOrder"), Qt::CaseInsensitive) == 0)
        return NameOrder;
    if (text.compare(QLatin1String("DefinitionOrder"), Qt::CaseInsensitive) == 0)
        return DefinitionOrder;
    return InvalidOrder;
}

} // namespace HmiCore
