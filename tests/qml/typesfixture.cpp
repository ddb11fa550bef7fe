// SPDX-License-Identifier: MIT
#include "typesfixture.h"

#include <HmiCore/HardKeyController>
#include <HmiCore/HmiActivationOverrideManager>
#include <HmiCore/HmiComplexKeyboard>
#include <HmiCore/HmiHandwriting>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiMarketPropertyStore>
#include <HmiCore/HmiRegionPropertyStore>
#include <HmiCore/HmiValueMapper>
#include <HmiGuiFramework/AppSettings>

using namespace HmiCore;

namespace {

/// The product's files, small.
const struct
{
    const char* name;
    const char* content;
} productFiles[] = {
    {"languageBundles/config.json",
     R"([{"bundleId": "Europe", "locales": ["de_DE", "fr_FR"], "default": "de_DE", "fallbackBundle": true}])"},
    {"languageBundles/properties.json",
     R"([{"bundleId": "*", "locale": "*", "properties": {"keyboard": "Latin"}},
         {"bundleId": "Europe", "locale": "de_DE", "properties": {"keyboard": "Qwertz"}}])"},
    {"regions.json", R"([{"id": "1", "propertyFile": "region.json"}])"},
    {"region.json", R"({"unit": "mile"})"},
    {"markets.json", R"([{"id": "1A", "propertyFile": "market.json"}])"},
    {"market.json", R"({"maxPresets": 12, "languageBundle": "Europe"})"},
    {"values.json",
     R"([{"valueName": "driveMode", "default": "Unknown", "values": [{"value": 1, "mapping": "Sport"}]}])"},
};

} // namespace

Dialler::Dialler(QObject* parent)
    : HmiIntentHandler(parent)
{
    addAction(HmiIntentManager::MakePhoneCall);
    HmiIntentManager::instance()->registerIntentHandler(this);
}

bool Dialler::performAction(int, const QList<QVariant>& data, bool, const QVariant&)
{
    if (m_hasPhone)
        dialled = data;
    return m_hasPhone;
}

void Dialler::setPhone(bool isThere)
{
    m_hasPhone = isThere;
    Q_EMIT actionStatusChanged(HmiIntentManager::MakePhoneCall, isThere);
}

PhoneOverride::PhoneOverride(QObject* parent)
    : HmiActivationOverride(parent)
{
    addOverrideDomain(domain);
    HmiActivationOverrideManager::instance()->registerOverride(this);
}

void PhoneOverride::setActive(bool isActive)
{
    if (isActive)
        activateNameOverride(domain);
    else
        deactivateNameOverride(domain);
}

TypesFixture::TypesFixture()
    : m_dialler(nullptr)
    , m_override(nullptr)
{
    for (const auto& file : productFiles)
        m_files.write(text(file.name), file.content);
    HmiGuiFramework::AppSettings::mainFolderPath = m_files.path() + QLatin1Char('/');
    HmiRegionPropertyStore::instance()->loadConfiguration(m_files.path(), text("regions.json"));
    HmiMarketPropertyStore::instance()->loadConfiguration(m_files.path(), text("markets.json"));
    HmiValueMapper::instance()->loadValueMapping(m_files.path(text("values.json")));
    HmiHandwriting::registerFactory(HmiHandwriting::SimplifiedChinese, &m_recognizers);
    HmiComplexKeyboard::registerFactory(HmiComplexKeyboard::TraditionalChinese, &m_keyboards);
    HardKeyController::instance();
}

void TypesFixture::key(int id, int state)
{
    AL2HMIBridge::BridgeTester::sendEvent("KeySource", "keyEvent", {id, state});
}

QStringList TypesFixture::endCapture()
{
    const QStringList unexpected = m_log->unexpected();
    m_log.reset();
    return unexpected;
}
