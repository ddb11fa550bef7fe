// SPDX-License-Identifier: MIT
#include "sampleplugin.h"

#include <HmiCore/HmiComplexKeyboard>

namespace {

/// QML asks for the engine by this number. Those of HmiComplexKeyboard::Language are the ones that a head unit's own keyboards
/// ask for; the first plugin that registers a language has it.
constexpr int language = LANGUAGE_NUMBER;

} // namespace

bool SamplePlugin::registerEngine(const QString& key, QObject* /*parent*/)
{
    if (key != QLatin1String("sample"))
        return false;
    HmiCore::HmiComplexKeyboard::registerFactory(language, &m_factory);
    return true;
}
