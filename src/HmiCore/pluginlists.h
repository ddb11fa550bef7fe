// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

namespace HmiCore {

/// Which module plugins may be loaded, from plugins.conf.
struct PluginLists
{
    static PluginLists read(const QString& fileName);

    QStringList whitelist;
    QStringList blacklist;

    // The white list only rescues names from the black list: an empty one restricts nothing.
    bool allow(const QString& name) const { return whitelist.contains(name) || !blacklist.contains(name); }
};

} // namespace HmiCore
