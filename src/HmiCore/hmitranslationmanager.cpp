// SPDX-License-Identifier: MIT
#include "hmitranslationmanager.h"

#include "hmimoduletranslation.h"
#include "hmitranslation.h"
#include "logcategories.h"

#include <QCoreApplication>
#include <QLocale>
#include <QQmlEngine>

namespace HmiCore {

HmiTranslationManager* HmiTranslationManager::instance()
{
    static auto* const manager = new HmiTranslationManager(QCoreApplication::instance());
    return manager;
}

QObject* HmiTranslationManager::translationManagerProvider(QQmlEngine*, QJSEngine*)
{
    QQmlEngine::setObjectOwnership(instance(), QQmlEngine::CppOwnership);
    return instance();
}

HmiTranslationManager::HmiTranslationManager(QObject* parent)
    : QObject(parent)
{
}

HmiTranslationManager::~HmiTranslationManager() = default;

QString HmiTranslationManager::currentLanguageId() const
{
    return m_currentLanguageId;
}

void HmiTranslationManager::activateHmiTranslation(HmiTranslation* translation)
{
    if (m_translation)
        m_translation->deactivate();
    m_translation = translation;
    if (m_translation)
        m_translation->activateTranslation(m_currentLanguageId);
}

void HmiTranslationManager::registerModuleTranslation(HmiModuleTranslation* moduleTranslation)
{
    if (!moduleTranslation)
        return;
    m_moduleTranslations.append(moduleTranslation);
    moduleTranslation->activateTranslation(
        m_currentLanguageId); // before there is a translator, unless the module made one
    QCoreApplication::installTranslator(moduleTranslation->translator());
}

bool HmiTranslationManager::retranslate(const QString& languageId)
{
    bool isComplete = true;
    if (m_translation && !m_translation->activateTranslation(languageId)) {
        qCWarning(coreLog) << "Failed to activate a translation:"
                           << "\nHmiTranslation"
                           << "\nLanguageId:" << languageId;
        isComplete = false;
    }
    for (const HmiModuleTranslation* const module : qAsConst(m_moduleTranslations)) {
        if (module->activateTranslation(languageId))
            continue;
        qCWarning(coreLog) << "Failed to activate a translation:"
                           << "\nModule:" << module->moduleId() << "\nLanguageId:" << languageId;
        isComplete = false;
    }
    return isComplete;
}

void HmiTranslationManager::setCurrentLanguageId(const QString& languageId)
{
    if (languageId == m_currentLanguageId)
        return;
    QLocale::setDefault(QLocale(languageId));
    if (retranslate(languageId)) {
        m_currentLanguageId = languageId;
        Q_EMIT currentLanguageIdChanged(languageId);
        return;
    }
    qCWarning(coreLog) << "Restoring old system locale.";
    QLocale::setDefault(QLocale(m_currentLanguageId));
    retranslate(m_currentLanguageId);
}

} // namespace HmiCore
