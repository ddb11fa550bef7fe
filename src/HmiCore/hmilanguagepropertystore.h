// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QHash>
#include <QMap>
#include <QObject>
#include <QPair>
#include <QString>
#include <QVariant>

QT_BEGIN_NAMESPACE
class QJSEngine;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief What depends on the language and the market's bundle: fonts, direction, keyboards, dates. GUI thread only.
///
/// Read once, from `languageBundles/properties.json` in the HMI's main folder. "*" stands for any bundle or locale.
class HMICORE_EXPORT HmiLanguagePropertyStore : public QObject
{
    Q_OBJECT

public:
    /// \brief The one store, made on the first call as a child of the application object.
    static HmiLanguagePropertyStore* instance();
    /// \brief instance() for the QML engine, which does not own it.
    static QObject* languagePropertyStoreProvider(QQmlEngine*, QJSEngine*);
    ~HmiLanguagePropertyStore() override;

    /// \brief The property in getStore(), which alone is asked: entries do not complete each other. Invalid when it lacks it.
    Q_INVOKABLE QVariant getLanguageProperty(const QString& bundleId, const QString& locale,
                                             const QString& propertyName) const;

    /// \brief The properties of (bundle, locale), else of (bundle, any), else of (any, any), else none.
    QMap<QString, QVariant> getStore(const QPair<QString, QString>& key) const;

private:
    using Stores = QHash<QPair<QString, QString>, QMap<QString, QVariant>>;

    explicit HmiLanguagePropertyStore(QObject* parent);
    Stores::const_iterator select(const QPair<QString, QString>& key) const;

    Stores m_stores;
};

} // namespace HmiCore
