// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QPluginLoader>
#include <QString>
#include <QStringList>

QT_BEGIN_NAMESPACE
class QDir;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief A file in a plugin directory, which may or may not be a plugin.
///
/// Reading the metadata does not load the library; what is damaged has none. A library that was loaded stays loaded when this object goes.
class PluginFile
{
public:
    PluginFile(const QDir& directory, const QString& fileName);
    Q_DISABLE_COPY(PluginFile)

    /// \brief Entry name without path.
    QString fileName() const { return m_fileName; }

    /// \brief Whether the file is a plugin whose metadata names this interface id.
    bool hasInterfaceId(const char* interfaceId) const;

    /// \brief Whether the plugin came with metadata of its own.
    bool hasOwnMetaData() const;

    /// \brief The plugin's name for the lists of allowed plugins; empty when it has none.
    QString name() const;

    /// \brief What the plugin can make, in the metadata's order.
    QStringList keys() const;

    /// \brief Loads the plugin and gives its root object, owned by the plugin; null when that fails.
    QObject* rootObject();

private:
    QJsonObject ownMetaData() const;

    const QString m_fileName;
    QPluginLoader m_loader;
    QJsonObject m_metaData; ///< empty when the file is no plugin or damaged
};

} // namespace HmiCore
