// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"
#include "hmilanguagepackcollection.h"

#include <QSortFilterProxyModel>
#include <QString>

namespace HmiCore {

/// \brief The platform's languages that a bundle offers, sorted as the bundle wants it, for a language menu.
///
/// Rows have the roles of the platform's language model. GUI thread only.
class HMICORE_EXPORT HmiLanguageBundleModel : public QSortFilterProxyModel
{
    Q_OBJECT
    Q_PROPERTY(QString bundleId READ bundleId WRITE setBundleId NOTIFY bundleIdChanged)
    Q_PROPERTY(int count READ count NOTIFY countChanged)
    Q_PROPERTY(int candidateLanguage READ candidateLanguage WRITE setCandidateLanguage NOTIFY candidateLanguageChanged)
    Q_PROPERTY(int supportedLanguage READ supportedLanguage NOTIFY supportedLanguageChanged)

public:
    explicit HmiLanguageBundleModel(QObject* parent = nullptr);
    ~HmiLanguageBundleModel() override;

    /// \brief The row of the platform's model that \a row shows; -1 for a row that is not there.
    Q_INVOKABLE int mapped(int row) const;

    QString bundleId() const;      ///< empty at first
    int count() const;             ///< of rows
    int candidateLanguage() const; ///< the platform's number; -1 at first
    int supportedLanguage() const; ///< of the candidate when it was set; -1 before

    /// \brief Shows another bundle; the fallback in place of an unknown one, and nothing without a fallback.
    void setBundleId(QString bundleId);

    /// \brief The language that somebody is about to choose.
    void setCandidateLanguage(int language);

    /// \brief The language itself when the bundle offers it, else the bundle's default.
    int bundleSupportedLanguage(int language) const;

    bool filterAcceptsRow(int sourceRow, const QModelIndex& sourceParent) const override;
    bool lessThan(const QModelIndex& left, const QModelIndex& right) const override;

Q_SIGNALS:
    void bundleIdChanged(const QString& bundleId);
    void countChanged(int count); ///< with another bundle only
    void candidateLanguageChanged(int language);
    void supportedLanguageChanged(int language); ///< with every new candidate

private:
    QString m_bundleId;
    HmiLanguagePackCollection::OrderingPolicy m_ordering = HmiLanguagePackCollection::InvalidOrder; ///< of the bundle
    int m_candidateLanguage = -1;
    int m_supportedLanguage = -1;
};

} // namespace HmiCore
