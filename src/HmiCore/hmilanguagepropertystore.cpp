// SPDX-License-Identifier: MIT
#include "hmilanguagepropertystore.h"

#include "languagebundlesfolder.h"
#include "languagepropertyparser.h"

#include <QCoreApplication>
#include <QQmlEngine>

namespace HmiCore {

HmiLanguagePropertyStore* HmiLanguagePropertyStore::instance()
{
    static auto* const store = new HmiLanguagePropertyStore(QCoreApplication::instance());
    return store;
}

QObject* HmiLanguagePropertyStore::languagePropertyStoreProvider(QQmlEngine*, QJSEngine*)
{
    QQmlEngine::setObjectOwnership(instance(), QQmlEngine::CppOwnership);
    return instance();
}

HmiLanguagePropertyStore::HmiLanguagePropertyStore(QObject* parent)
    : QObject(parent)
    , m_stores(LanguagePropertyParser().parse(QStringLiteral("properties.json"), languageBundlesFolder()))
{
}

HmiLanguagePropertyStore::~HmiLanguagePropertyStore() = default;

QVariant HmiLanguagePropertyStore::getLanguageProperty(const QString& bundleId, const QString& locale,
                                                       const QString& propertyName) const
{
    const auto store = select(qMakePair(bundleId, locale));
    return store == m_stores.constEnd() ? QVariant() : store->value(propertyName);
}

QMap<QString, QVariant> HmiLanguagePropertyStore::getStore(const QPair<QString, QString>& key) const
{
    const auto store = select(key);
    return store == m_stores.constEnd() ? QMap<QString, QVariant>() : *store;
}

HmiLanguagePropertyStore::Stores::const_iterator
HmiLanguagePropertyStore::select(const QPair<QString, QString>& key) const
{
    const QString any = QStringLiteral("*");
    auto store = m_stores.constFind(key);
    if (store == m_stores.constEnd() && key.second != any)
        store = m_stores.constFind(qMakePair(key.first, any));
    if (store == m_stores.constEnd() && key.first != any)
        store = m_stores.constFind(qMakePair(any, any));
    return store;
}

} // namespace HmiCore
