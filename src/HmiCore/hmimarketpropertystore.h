// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QJsonArray>
#include <QMap>
#include <QObject>
#include <QString>
#include <QVariant>

QT_BEGIN_NAMESPACE
class QJSEngine;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief Values of named properties, for each of many configurations that have a number. GUI thread only.
///
/// A configuration document says which file belongs to which number. The files are read when they are first needed and kept;
/// one that cannot be read is tried again each time.
class HMICORE_EXPORT HmiPropertyStore : public QObject
{
    Q_OBJECT

public:
    explicit HmiPropertyStore(QObject* parent);
    ~HmiPropertyStore() override;

    /// \brief Uses the document \a configFile in the directory \a path from now on.
    ///
    /// What was read before stays. A document that is missing or damaged, after a warning, knows no configurations.
    void loadConfiguration(const QString& path, const QString& configFile);

    /// \brief The property of configuration \a id; may read files.
    ///
    /// A configuration that is unknown or cannot be read is replaced by the fallback; without one the result is invalid. A
    /// property that is missing is taken from configuration -1; when that lacks it too, it is the text "Unknown property".
    Q_INVOKABLE QVariant getProperty(int id, const QString& propertyName);

private:
    friend class ConfigurationProcessor;

    QMap<int, QMap<QString, QVariant>>::const_iterator find(int id);

    QMap<int, QString> m_propertyFiles;
    QMap<int, QMap<QString, QVariant>> m_properties;
    qint32 m_fallbackId = -1;
    QString m_configurationPath;
};

/// \brief The properties of the region. The embedding program loads its configuration.
class HMICORE_EXPORT HmiRegionPropertyStore : public HmiPropertyStore
{
    Q_OBJECT

public:
    /// \brief The one store, made on the first call as a child of the application object.
    static HmiRegionPropertyStore* instance();
    /// \brief instance() for the QML engine, which does not own it.
    static QObject* regionPropertyStoreProvider(QQmlEngine*, QJSEngine*);

private:
    using HmiPropertyStore::HmiPropertyStore;
};

/// \brief The properties of the market, by the country the vehicle is made for. The embedding program loads its configuration.
class HMICORE_EXPORT HmiMarketPropertyStore : public HmiPropertyStore
{
    Q_OBJECT

public:
    /// \brief The one store, made on the first call as a child of the application object.
    static HmiMarketPropertyStore* instance();
    /// \brief instance() for the QML engine, which does not own it.
    static QObject* marketPropertyStoreProvider(QQmlEngine*, QJSEngine*);

private:
    using HmiPropertyStore::HmiPropertyStore;
};

/// \brief Reads the documents of property stores. Failures are warnings and give nothing.
class HMICORE_EXPORT ConfigurationProcessor
{
public:
    /// \brief The array at the top of a configuration document, empty when there is none.
    static QJsonArray readConfigurationDocument(const QString& filePath);

    /// \brief Replaces the files and the fallback that \a store knows by those of a document.
    ///
    /// Numbers are texts in base 16; elements without a proper one are skipped. Later elements win.
    static void parseMapping(const QString& filePath, HmiPropertyStore* store);

    /// \brief Puts the object at the top of a property file into \a properties under \a id.
    static void parse(const QString& filePath, int id, QMap<int, QMap<QString, QVariant>>& properties);
};

} // namespace HmiCore
