// SPDX-License-Identifier: MIT
#include "hmilanguagebundlemodel.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/LanguageModel>

using AL2HMIBridge::GlobalSource;
using AL2HMIBridge::LanguageModel;

namespace HmiCore {

namespace {

// Roles of the platform's model.
constexpr int localeRole = 1;
constexpr int nameRole = 2;

QString localeOf(const QModelIndex& language)
{
    return language.data(localeRole).toString();
}

} // namespace

HmiLanguageBundleModel::HmiLanguageBundleModel(QObject* parent)
    : QSortFilterProxyModel(parent)
{
    setSourceModel(LanguageModel::instance());
    setSortRole(nameRole);
    sort(0, Qt::AscendingOrder);
}

HmiLanguageBundleModel::~HmiLanguageBundleModel() = default;

int HmiLanguageBundleModel::mapped(int row) const
{
    return mapToSource(index(row, 0)).row();
}

QString HmiLanguageBundleModel::bundleId() const
{
    return m_bundleId;
}

int HmiLanguageBundleModel::count() const
{
    return rowCount();
}

int HmiLanguageBundleModel::candidateLanguage() const
{
    return m_candidateLanguage;
}

int HmiLanguageBundleModel::supportedLanguage() const
{
    return m_supportedLanguage;
}

void HmiLanguageBundleModel::setBundleId(QString bundleId)
{
    const HmiLanguagePackCollection* const packs = HmiLanguagePackCollection::instance();
    if (!packs->bundles().contains(bundleId))
        bundleId = packs->fallbackBundleId();
    if (bundleId == m_bundleId)
        return;
    m_bundleId = bundleId;
    m_ordering = packs->policyForBundle(bundleId);
    Q_EMIT bundleIdChanged(bundleId);
    invalidate();
    Q_EMIT countChanged(count());
}

void HmiLanguageBundleModel::setCandidateLanguage(int language)
{
    if (language == m_candidateLanguage)
        return;
    m_candidateLanguage = language;
    Q_EMIT candidateLanguageChanged(language);
    m_supportedLanguage = bundleSupportedLanguage(language);
    Q_EMIT supportedLanguageChanged(m_supportedLanguage);
}

int HmiLanguageBundleModel::bundleSupportedLanguage(int language) const
{
    const HmiLanguagePackCollection* const packs = HmiLanguagePackCollection::instance();
    const LanguageModel* const languages = LanguageModel::instance();
    const QString locale = languages->localeFromId(static_cast<GlobalSource::SystemLanguage>(language));
    if (packs->inBundle(m_bundleId, locale))
        return language;
    return languages->idForLocale(packs->defaultForBundle(m_bundleId));
}

bool HmiLanguageBundleModel::filterAcceptsRow(int sourceRow, const QModelIndex&) const
{
    const QModelIndex language = LanguageModel::instance()->index(sourceRow, 0);
    return HmiLanguagePackCollection::instance()->inBundle(m_bundleId, localeOf(language));
}

bool HmiLanguageBundleModel::lessThan(const QModelIndex& left, const QModelIndex& right) const
{
    switch (m_ordering) {
    case HmiLanguagePackCollection::NameOrder:
        return left.data(nameRole).toString().compare(right.data(nameRole).toString(), Qt::CaseInsensitive) < 0;
    case HmiLanguagePackCollection::DefinitionOrder: {
        const HmiLanguagePackCollection* const packs = HmiLanguagePackCollection::instance();
        return packs->indexInBundle(m_bundleId, localeOf(left)) < packs->indexInBundle(m_bundleId, localeOf(right));
    }
    case HmiLanguagePackCollection::InvalidOrder:
        return QSortFilterProxyModel::lessThan(left, right);
    }
    return false;
}

} // namespace HmiCore
