// SPDX-License-Identifier: MIT
#include "zhuyinplugin.h"

#include <HmiCore/HmiComplexKeyboard>

using HmiCore::HmiComplexKeyboard;

bool ZhuyinPlugin::registerEngine(const QString& key, QObject* /*parent*/)
{
    if (key != QLatin1String("TraditionalChinese"))
        return false;
    if (!m_registered)
        HmiComplexKeyboard::registerFactory(HmiComplexKeyboard::TraditionalChinese, &m_factory);
    m_registered = true;
    return true;
}
