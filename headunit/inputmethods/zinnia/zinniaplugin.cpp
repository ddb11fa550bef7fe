// SPDX-License-Identifier: MIT
#include "zinniaplugin.h"

#include "zinniafactory.h"

#include <HmiCore/HmiHandwriting>

#include <QFile>

#include <algorithm>
#include <iterator>

using HmiCore::HmiHandwriting;

namespace {

struct Engine
{
    const char* key;
    int language;
    const char* modelFile;
};

constexpr Engine engines[] = {
    {"SimplifiedChinese", HmiHandwriting::SimplifiedChinese, ZINNIA_MODELS "/handwriting-zh_CN.model"},
    {"TraditionalChinese", HmiHandwriting::TraditionalChinese, ZINNIA_MODELS "/handwriting-ja.model"},
};

} // namespace

bool ZinniaPlugin::registerEngine(const QString& key, QObject* /*parent*/)
{
    const auto engine = std::find_if(std::begin(engines), std::end(engines),
                                     [&key](const Engine& candidate) { return key == QLatin1String(candidate.key); });
    if (engine == std::end(engines))
        return false;
    if (!m_registered.contains(engine->language))
        HmiHandwriting::registerFactory(engine->language,
                                        new Zinnia::ZinniaFactory(QFile::decodeName(engine->modelFile), this));
    m_registered.insert(engine->language);
    return true;
}
