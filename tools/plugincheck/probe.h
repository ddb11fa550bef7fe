// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/// \brief The process that loads the plugin: a head unit that has no other plugin.
namespace Probe {

/// \brief Loads \a plugin as the head unit does and writes what comes of it into \a report; gives the exit code.
///
/// The plugin lies in the plugin directories beside this program as well, where HmiApplication finds it. To be called first
/// of all in main(). The process may end anywhere in it.
int run(int& argc, char** argv, const QString& report, const QString& plugin);

} // namespace Probe
