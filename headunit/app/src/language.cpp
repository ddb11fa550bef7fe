// SPDX-License-Identifier: MIT
#include "language.h"

#include "market.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/LanguageModel>
#include <HmiCore/HmiLanguageBundleModel>
#include <HmiCore/HmiLanguagePropertyStore>
#include <HmiCore/HmiManager>
#include <HmiCore/HmiTranslationManager>
#include <HmiGuiFramework/AppSettings>

#include <QFont>
#include <QGuiApplication>
#include <QQmlEngine>

using AL2HMIBridge::GlobalSource;
using AL2HMIBridge::LanguageModel;
using HmiCore::HmiLanguageBundleModel;
using HmiCore::HmiLanguagePropertyStore;
using HmiCore::HmiManager;
using HmiCore::HmiTranslationManager;
using HmiGuiFramework::AppSettings;

namespace {

QString localeOf(int language)
{
    return LanguageModel::instance()->localeFromId(static_cast<GlobalSource::SystemLanguage>(language));
}

} // namespace

Language::Language(Market* market, QQmlEngine* engine, QObject* parent)
    : QObject(parent)
    , m_market(market)
    , m_engine(engine)
    , m_translation(AppSettings::mainFolderPath + QLatin1String("translations/app"), nullptr)
{
}

Language::~Language() = default;

void Language::start()
{
    HmiTranslationManager* const manager = HmiTranslationManager::instance();
    manager->activateHmiTranslation(&m_translation);
    connect(manager, &HmiTranslationManager::currentLanguageIdChanged, this, &Language::present);
    connect(GlobalSource::instance(), &GlobalSource::systemLanguageChanged, this, &Language::follow);
    connect(m_market, &Market::changed, this, &Language::follow);
    follow();
}

void Language::choose(int language)
{
    GlobalSource::instance()->setSystemLanguage(static_cast<GlobalSource::SystemLanguage>(language));
}

void Language::follow()
{
    HmiLanguageBundleModel bundle(nullptr);
    bundle.setBundleId(m_market->languageBundle());
    const int language = bundle.bundleSupportedLanguage(GlobalSource::instance()->systemLanguage());
    const QString locale = localeOf(language);
    HmiTranslationManager* const manager = HmiTranslationManager::instance();
    const QString before = manager->currentLanguageId();
    manager->setCurrentLanguageId(locale);
    if (manager->currentLanguageId() == locale)
        return;
    showTexts();
    Q_EMIT refused(LanguageModel::instance()->index(language, 0).data(LanguageModel::NameRole).toString());
    const int former = LanguageModel::instance()->idForLocale(before);
    if (former >= 0)
        choose(former);
}

void Language::present()
{
    AppSettings::instance()->setRightToLeft(property("rightToLeft").toBool());
    const QStringList families = property("fonts").toStringList();
    if (!families.isEmpty()) {
        QFont font = QGuiApplication::font();
        font.setFamilies(families);
        QGuiApplication::setFont(font);
    }
    showTexts();
    Q_EMIT changed();
}

/// Modules bring their translators in order first; then all texts are asked for again.
void Language::showTexts()
{
    Q_EMIT HmiManager::instance()->hmiRetranslated();
    m_engine->retranslate();
}

QString Language::dateFormat() const
{
    return property("dateFormat").toString();
}

QString Language::keyboard() const
{
    return property("keyboard").toString();
}

QVariant Language::property(const char* name) const
{
    return HmiLanguagePropertyStore::instance()->getLanguageProperty(
        m_market->languageBundle(), HmiTranslationManager::instance()->currentLanguageId(), QString::fromLatin1(name));
}
