// SPDX-License-Identifier: MIT
#include "hmihandwriting.h"

#include "dummyrecognizer.h"
#include "factoryregistry.h"
#include "hmihandwritingrecognizerfactory.h"
#include "logcategories.h"

namespace HmiCore {

namespace {
Q_GLOBAL_STATIC(FactoryRegistry<HmiHandwritingRecognizerFactory>, s_factories)
}

HmiHandwriting::HmiHandwriting(QObject* parent)
    : QObject(parent)
{
}

/// The recognizer goes as a child, unless its engine works: then it lives until that is done.
HmiHandwriting::~HmiHandwriting()
{
    release();
}

void HmiHandwriting::registerFactory(int language, HmiHandwritingRecognizerFactory* factory)
{
    s_factories->add(language, factory, "Handwriting recognizer factory registration failed, duplicated language.");
}

HmiHandwritingRecognizer* HmiHandwriting::recognizer()
{
    if (!m_recognizer)
        m_recognizer = new DummyRecognizer(this);
    return m_recognizer;
}

int HmiHandwriting::language() const
{
    return m_language;
}

void HmiHandwriting::setLanguage(int language)
{
    if (language == m_language)
        return;
    m_language = language;
    Q_EMIT languageChanged(language);
    updateRecognizer();
}

/// A recognizer whose engine works must not be deleted with its parent.
void HmiHandwriting::release()
{
    if (m_recognizer && !m_recognizer->shutDown())
        m_recognizer->setParent(nullptr);
}

void HmiHandwriting::updateRecognizer()
{
    release();
    if (m_recognizer)
        m_recognizer->deleteLater();
    m_recognizer.clear();

    if (HmiHandwritingRecognizerFactory* const factory = s_factories->find(m_language)) {
        m_recognizer = factory->createRecognizer(this);
        if (!m_recognizer)
            qCWarning(coreLog) << Q_FUNC_INFO << "Engine creation failed.";
    } else {
        qCWarning(coreLog) << "Unsupported language." << m_language;
    }
    Q_EMIT recognizerChanged(recognizer());
}

} // namespace HmiCore
