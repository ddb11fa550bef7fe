// SPDX-License-Identifier: MIT
#include "latinplugin.h"

#include <HmiCore/HmiHandwriting>

using HmiCore::HmiHandwriting;

bool LatinPlugin::registerEngine(const QString& key, QObject* /*parent*/)
{
    if (key != QLatin1String("Latin"))
        return false;
    if (!m_registered)
        HmiHandwriting::registerFactory(HmiHandwriting::Latin, &m_factory);
    m_registered = true;
    return true;
}
