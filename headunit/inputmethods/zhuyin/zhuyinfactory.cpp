// SPDX-License-Identifier: MIT
#include "zhuyinfactory.h"

#include "zhuyindecoder.h"
#include "zhuyinengine.h"

#include <QLoggingCategory>
#include <QTimer>

namespace Zhuyin {

namespace {
Q_LOGGING_CATEGORY(zhuyinLog, "headunit.inputmethods.zhuyin")
}

ZhuyinFactory::ZhuyinFactory(QObject* parent)
    : ZhuyinFactory(QStringLiteral(ZHUYIN_DICTIONARY), parent)
{
}

ZhuyinFactory::ZhuyinFactory(const QString& dictionary, QObject* parent)
    : HmiComplexKeyboardEngineFactory(parent)
    , m_dictionary(dictionary)
{
}

HmiCore::HmiComplexKeyboardEngine* ZhuyinFactory::createEngine(QObject* parent)
{
    std::unique_ptr<ZhuyinDecoder> decoder = ZhuyinDecoder::create(m_dictionary);
    if (!decoder) {
        qCWarning(zhuyinLog) << "Cannot open the dictionary in" << m_dictionary;
        return nullptr;
    }
    auto* const engine = new ZhuyinEngine(std::move(decoder), parent);
    QTimer::singleShot(0, engine, &ZhuyinEngine::warmUp);
    return engine;
}

} // namespace Zhuyin
