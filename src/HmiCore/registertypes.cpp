// SPDX-License-Identifier: MIT
#include "hardkeycontroller.h"
#include "hmiactivationoverridemanager.h"
#include "hmicomplexkeyboard.h"
#include "hmicore.h"
#include "hmihandwriting.h"
#include "hmiintentmanager.h"
#include "hmiintentmonitor.h"
#include "hmilanguagebundlemodel.h"
#include "hmilanguagepropertystore.h"
#include "hmimarketpropertystore.h"
#include "hmitranslationmanager.h"
#include "hmivaluemapper.h"

#include <QtQml>

namespace HmiCore {

void registerTypes()
{
    qmlRegisterUncreatableType<HmiHandwritingRecognizer>("HmiCore", 1, 0, "HmiHandwritingRecognizer",
                                                         QStringLiteral("HmiHandwritingRecognizer is not creatable"));
    qmlRegisterUncreatableType<HmiComplexKeyboardEngine>("HmiCore", 1, 0, "HmiComplexKeyboardEngine",
                                                         QStringLiteral("HmiComplexKeyboardEngine is not creatable"));
    qmlRegisterSingletonType<HmiTranslationManager>("HmiCore", 1, 0, "HmiTranslationManager",
                                                    HmiTranslationManager::translationManagerProvider);
    qmlRegisterSingletonType<HmiRegionPropertyStore>("HmiCore", 1, 0, "HmiRegionPropertyStore",
                                                     HmiRegionPropertyStore::regionPropertyStoreProvider);
    qmlRegisterSingletonType<HmiMarketPropertyStore>("HmiCore", 1, 0, "HmiMarketPropertyStore",
                                                     HmiMarketPropertyStore::marketPropertyStoreProvider);
    qmlRegisterSingletonType<HmiValueMapper>("HmiCore", 1, 0, "HmiValueMapper", HmiValueMapper::valueMapperProvider);
    qmlRegisterSingletonType<HardKeyController>("HmiCore", 1, 0, "HardKeyController",
                                                HardKeyController::hardKeyControllerProvider);
    qmlRegisterUncreatableType<HmiIntentMonitor>("HmiIntents", 1, 0, "HmiIntentMonitor",
                                                 QStringLiteral("HmiIntentMonitor is not creatable"));
    qmlRegisterSingletonType<HmiIntentManager>("HmiIntents", 1, 0, "HmiIntents",
                                               HmiIntentManager::intentManagerProvider);
    qmlRegisterSingletonType<HmiActivationOverrideManager>(
        "HmiOverrides", 1, 0, "HmiOverrides", HmiActivationOverrideManager::activationOverrideManagerProvider);
    qmlRegisterSingletonType<HmiLanguagePropertyStore>("HmiCore", 1, 0, "HmiLanguagePropertyStore",
                                                       HmiLanguagePropertyStore::languagePropertyStoreProvider);
    qmlRegisterType<HmiHandwriting>("HmiCore", 1, 0, "HmiHandwriting");
    qmlRegisterType<HmiComplexKeyboard>("HmiCore", 1, 0, "HmiComplexKeyboard");
    qmlRegisterType<HmiLanguageBundleModel>("HmiCore", 1, 0, "HmiLanguageBundleModel");
}

} // namespace HmiCore
