// SPDX-License-Identifier: MIT
#include "hmicomplexkeyboard.h"

#include "dummyengine.h"
#include "factoryregistry.h"
#include "hmicomplexkeyboardenginefactory.h"
#include "logcategories.h"

namespace HmiCore {

namespace {
Q_GLOBAL_STATIC(FactoryRegistry<HmiComplexKeyboardEngineFactory>, s_factories)
}

HmiComplexKeyboard::HmiComplexKeyboard(QObject* parent)
    : QObject(parent)
{
}

HmiComplexKeyboard::~HmiComplexKeyboard() = default;

void HmiComplexKeyboard::registerFactory(int language, HmiComplexKeyboardEngineFactory* factory)
{
    s_factories->add(language, factory, "Complex keyboard factory registration failed, duplicated language.");
}

HmiComplexKeyboardEngine* HmiComplexKeyboard::engine()
{
    if (!m_engine)
        m_engine = new DummyEngine(this);
    return m_engine;
}

int HmiComplexKeyboard::language() const
{
    return m_language;
}

void HmiComplexKeyboard::setLanguage(int language)
{
    if (language == m_language)
        return;
    m_language = language;
    Q_EMIT languageChanged(language);
    updateEngine();
}

void HmiComplexKeyboard::updateEngine()
{
    if (m_engine)
        m_engine->deleteLater();
    m_engine.clear();

    if (HmiComplexKeyboardEngineFactory* const factory = s_factories->find(m_language)) {
        m_engine = factory->createEngine(this);
        if (!m_engine)
            qCWarning(coreLog) << Q_FUNC_INFO << "Engine creation failed.";
    } else {
        qCWarning(coreLog) << Q_FUNC_INFO << "Unsupported language." << m_language;
    }
    Q_EMIT engineChanged(engine());
}

} // namespace HmiCore
