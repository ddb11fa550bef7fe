// SPDX-License-Identifier: MIT
#include "pinyinplugin.h"

#include <HmiCore/HmiComplexKeyboard>

using HmiCore::HmiComplexKeyboard;

bool PinyinPlugin::registerEngine(const QString& key, QObject* /*parent*/)
{
    if (key != QLatin1String("SimplifiedChinese"))
        return false;
    if (!m_registered)
        HmiComplexKeyboard::registerFactory(HmiComplexKeyboard::SimplifiedChinese, &m_factory);
    m_registered = true;
    return true;
}
