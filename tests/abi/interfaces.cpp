// SPDX-License-Identifier: MIT
#include <HmiCore/InputMethodEngineInterface>
#include <HmiCore/ModuleInterface>

namespace HmiCore {

// The plugin interfaces are headers only. A library that uses them makes what plugins rely on visible.
Q_DECL_EXPORT void usePlugins(ModuleInterface&, InputMethodEngineInterface&) {}

} // namespace HmiCore
