// SPDX-License-Identifier: MIT
#include "hmimarketpropertystore.h"

#include "jsonfile.h"
#include "logcategories.h"

#include <QCoreApplication>
#include <QJsonObject>
#include <QQmlEngine>

namespace HmiCore {

namespace {

constexpr int noFallback = -1;
constexpr int defaultProperties = -1; ///< configuration that fills the gaps of all others

struct Messages
{
    const char* missing;
    const char* unreadable;
    const char* malformed;
};

constexpr Messages aboutDocuments{
    "Property config file does not exist:", "Can't read property config file:", "Property config file parse error:"};
constexpr Messages aboutPropertyFiles{
    "Property file does not exist:", "Can't read property file:", "Property file parse error:"};

JsonFile read(const QString& filePath, const Messages& messages)
{
    const JsonFile file = JsonFile::read(filePath);
    switch (file.outcome) {
    case JsonFile::Read:
        break;
    case JsonFile::Missing:
        qCWarning(coreLog) << messages.missing << filePath;
        break;
    case JsonFile::Unreadable:
        qCWarning(coreLog) << messages.unreadable << filePath;
        break;
    case JsonFile::Malformed:
        qCWarning(coreLog) << messages.malformed << file.parseError;
        break;
    }
    return file;
}

/// Qt's versions differ in what they make of negative numbers.
QString hexadecimal(int id)
{
    const QString digits = QString::number(qAbs(qint64(id)), 16);
    return id < 0 ? QLatin1Char('-') + digits : digits;
}

template <typename Store>
QObject* provide(Store* store)
{
    QQmlEngine::setObjectOwnership(store, QQmlEngine::CppOwnership);
    return store;
}

} // namespace

HmiPropertyStore::HmiPropertyStore(QObject* parent)
    : QObject(parent)
{
}

HmiPropertyStore::~HmiPropertyStore() = default;

void HmiPropertyStore::loadConfiguration(const QString& path, const QString& configFile)
{
    m_configurationPath = path;
    ConfigurationProcessor::parseMapping(path + QLatin1Char('/') + configFile, this);
    qCDebug(coreLog) << "HMI properties:" << m_propertyFiles;
}

QVariant HmiPropertyStore::getProperty(int id, const QString& propertyName)
{
    const auto entry = find(id);
    if (entry != m_properties.constEnd()) {
        const auto property = entry->constFind(propertyName);
        if (property != entry->constEnd())
            return *property;
        const auto defaults = find(defaultProperties);
        if (defaults != m_properties.constEnd()) {
            const auto byDefault = defaults->constFind(propertyName);
            if (byDefault != defaults->constEnd())
                return *byDefault;
        }
        qCDebug(coreLog) << "Invalid property:" << propertyName;
        return QStringLiteral("Unknown property"); // shown by QML
    }

    qCDebug(coreLog) << "Invalid id:" << hexadecimal(id);
    if (m_fallbackId == noFallback) {
        qCDebug(coreLog) << "No fallback provided.";
        return QVariant();
    }
    return m_fallbackId == id ? QVariant() : getProperty(m_fallbackId, propertyName);
}

QMap<int, QMap<QString, QVariant>>::const_iterator HmiPropertyStore::find(int id)
{
    const auto cached = m_properties.constFind(id);
    if (cached != m_properties.constEnd())
        return cached;
    const auto file = m_propertyFiles.constFind(id);
    if (file == m_propertyFiles.constEnd())
        return m_properties.constEnd();
    ConfigurationProcessor::parse(m_configurationPath + QLatin1Char('/') + *file, id, m_properties);
    return m_properties.constFind(id);
}

HmiRegionPropertyStore* HmiRegionPropertyStore::instance()
{
    static auto* const store = new HmiRegionPropertyStore(QCoreApplication::instance());
    return store;
}

QObject* HmiRegionPropertyStore::regionPropertyStoreProvider(QQmlEngine*, QJSEngine*)
{
    return provide(instance());
}

HmiMarketPropertyStore* HmiMarketPropertyStore::instance()
{
    static auto* const store = new HmiMarketPropertyStore(QCoreApplication::instance());
    return store;
}

QObject* HmiMarketPropertyStore::marketPropertyStoreProvider(QQmlEngine*, QJSEngine*)
{
    return provide(instance());
}

QJsonArray ConfigurationProcessor::readConfigurationDocument(const QString& filePath)
{
    return read(filePath, aboutDocuments).document.array();
}

void ConfigurationProcessor::parseMapping(const QString& filePath, HmiPropertyStore* store)
{
    store->m_propertyFiles.clear();
    store->m_fallbackId = noFallback;
    const QJsonArray elements = readConfigurationDocument(filePath);
    for (const QJsonValue& element : elements) {
        const QJsonObject object = element.toObject();
        const QString text = object.value(QLatin1String("id")).toString();
        bool isId = false;
        const int id = text.toInt(&isId, 16);
        if (!isId || text.contains(QChar(QChar::Null))) // Qt 6 takes what comes before
            continue;
        const auto file = object.constFind(QLatin1String("propertyFile"));
        if (file != object.constEnd())
            store->m_propertyFiles.insert(id, file->toString());
        if (object.value(QLatin1String("isFallback")).toBool())
            store->m_fallbackId = id;
    }
}

void ConfigurationProcessor::parse(const QString& filePath, int id, QMap<int, QMap<QString, QVariant>>& properties)
{
    const JsonFile file = read(filePath, aboutPropertyFiles);
    if (file.outcome == JsonFile::Read)
        properties.insert(id, file.document.object().toVariantMap());
}

} // namespace HmiCore
