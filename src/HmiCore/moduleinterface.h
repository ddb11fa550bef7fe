// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

namespace HmiCore {

class HmiModuleIntegration;

/// \brief What the root object of a module plugin implements.
///
/// \code
/// class RadioPlugin : public QObject, public HmiCore::ModuleInterface
/// {
///     Q_OBJECT
///     Q_PLUGIN_METADATA(IID "com.kest.ivi.ModuleInterface" FILE "radio.json")
///     Q_INTERFACES(HmiCore::ModuleInterface)
/// \endcode
///
/// The metadata file is a JSON object with the plugin's "Name", which the lists in plugins.conf refer to, and an array of
/// strings "Keys", one per module integration. Neither the root object's constructor nor these operations may throw: an
/// exception is not caught by the core and ends the process.
class ModuleInterface
{
public:
    virtual ~ModuleInterface() = default;

    /// \brief Makes the module integration of a key, owned by \a parent; null when it cannot. Called in the GUI thread.
    virtual HmiModuleIntegration* createModuleIntegration(const QString& key, QObject* parent) = 0;
};

} // namespace HmiCore

Q_DECLARE_INTERFACE(HmiCore::ModuleInterface, "com.kest.ivi.ModuleInterface")
