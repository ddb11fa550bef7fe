// SPDX-License-Identifier: MIT
#include "moduletranslation.h"

#include <HmiCore/HmiManager>
#include <HmiCore/HmiModuleTranslation>
#include <HmiCore/HmiTranslationManager>
#include <HmiGuiFramework/AppSettings>

#include <QCoreApplication>
#include <QTranslator>

using HmiCore::HmiManager;
using HmiCore::HmiModuleTranslation;
using HmiCore::HmiTranslationManager;
using HmiGuiFramework::AppSettings;

void registerModuleTranslation(const QString& module, QObject* parent)
{
    auto* const translation = new HmiModuleTranslation(
        AppSettings::mainFolderPath + QLatin1String("translations/") + module, QStringLiteral("_"), parent);
    translation->translator(); // made first, so that the present language is loaded at once
    HmiTranslationManager::instance()->registerModuleTranslation(translation);

    // The product's translators leave no text to those that were installed before them: the module's has to be later.
    QObject::connect(HmiManager::instance(), &HmiManager::hmiRetranslated, translation, [translation] {
        QCoreApplication::removeTranslator(translation->translator());
        QCoreApplication::installTranslator(translation->translator());
    });
}
