// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QMap>
#include <QObject>
#include <QString>
#include <QStringList>

namespace HmiCore {

/// \brief The language bundles: which locales a market offers, in which order, and which one by default. GUI thread only.
///
/// Read once, from `languageBundles/config.json` in the HMI's main folder.
class HMICORE_EXPORT HmiLanguagePackCollection : public QObject
{
    Q_OBJECT

public:
    /// \brief How the languages of a bundle are listed.
    enum OrderingPolicy {
        InvalidOrder = 0,    ///< unknown policy or bundle
        NameOrder = 1,       ///< by their names as shown
        DefinitionOrder = 2, ///< as the bundle lists them
    };

    /// \brief The languages that a market offers.
    struct LanguageBundle
    {
        QStringList locales;                          ///< in the order of the bundle
        QString defaultLocale;                        ///< for a language that the bundle lacks
        OrderingPolicy orderingPolicy = InvalidOrder; ///< how they are listed
        bool isFallback = false;                      ///< stands in for bundles that are unknown
    };

    /// \brief The one collection, made on the first call as a child of the application object.
    static HmiLanguagePackCollection* instance();
    ~HmiLanguagePackCollection() override;

    /// \brief Whether the bundle has exactly this locale.
    bool inBundle(const QString& bundleId, const QString& locale) const;

    /// \brief Whether the platform knows the language and the vehicle's market offers it.
    bool supported(int languageId) const;

    OrderingPolicy policyForBundle(const QString& bundleId) const; ///< InvalidOrder for an unknown bundle

    /// \brief First position of the locale in the bundle, from 0; -1 when it is not there.
    int indexInBundle(const QString& bundleId, const QString& locale) const;

    QString defaultForBundle(const QString& bundleId) const;  ///< empty for an unknown bundle
    QString fallbackBundleId() const;                         ///< empty when none is marked
    QStringList bundles() const;                              ///< all, in order of their ids
    QStringList bundleLocales(const QString& bundleId) const; ///< empty for an unknown bundle

    /// \brief The platform's number of each of bundleLocales().
    QList<int> bundleLanguageIds(const QString& bundleId) const;

    /// \brief The policy that a text names, in whatever case.
    static OrderingPolicy orderPolicyFromString(const QString& text);

private:
    explicit HmiLanguagePackCollection(QObject* parent);

    QMap<QString, LanguageBundle> m_bundles;
    QString m_fallbackBundleId;
};

} // namespace HmiCore
