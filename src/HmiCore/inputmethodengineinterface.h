// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

namespace HmiCore {

/// \brief What the root object of an input-method plugin implements.
///
/// Its metadata has the interface id "com.kest.hmi.InputMethodEngineInterface" and a JSON file with an array of strings
/// "Keys", one per engine. Neither the root object's constructor nor these operations may throw: an exception is not
/// caught by the core and ends the process.
class InputMethodEngineInterface
{
public:
    virtual ~InputMethodEngineInterface() = default;

    /// \brief Registers the engine of a key; what is made for it may be owned by \a parent. False when it cannot.
    ///
    /// Called once per key, in the GUI thread.
    virtual bool registerEngine(const QString& key, QObject* parent) = 0;
};

} // namespace HmiCore

Q_DECLARE_INTERFACE(HmiCore::InputMethodEngineInterface, "com.kest.hmi.InputMethodEngineInterface")
