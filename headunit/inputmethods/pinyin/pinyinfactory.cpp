// SPDX-License-Identifier: MIT
#include "pinyinfactory.h"

#include "pinyindecoder.h"
#include "pinyinengine.h"

#include <QLoggingCategory>

namespace Pinyin {

namespace {
Q_LOGGING_CATEGORY(pinyinLog, "headunit.inputmethods.pinyin")
}

PinyinFactory::PinyinFactory(QObject* parent)
    : PinyinFactory(QStringLiteral(PINYIN_DICTIONARY), parent)
{
}

PinyinFactory::PinyinFactory(const QString& dictionary, QObject* parent)
    : HmiComplexKeyboardEngineFactory(parent)
    , m_dictionary(dictionary)
{
}

HmiCore::HmiComplexKeyboardEngine* PinyinFactory::createEngine(QObject* parent)
{
    std::shared_ptr<PinyinDecoder> decoder = PinyinDecoder::shared(m_dictionary);
    if (!decoder) {
        qCWarning(pinyinLog) << "Cannot open the dictionary" << m_dictionary;
        return nullptr;
    }
    return new PinyinEngine(std::move(decoder), parent);
}

} // namespace Pinyin
