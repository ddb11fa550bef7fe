// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QJsonArray>
#include <QMap>
#include <QObject>
#include <QPair>
#include <QString>
#include <QVariant>

QT_BEGIN_NAMESPACE
class QJSEngine;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief What the HMI shows or uses for the numbers that the platform reports, by the name of the value. GUI thread only.
class HMICORE_EXPORT HmiValueMapper : public QObject
{
    Q_OBJECT

public:
    /// \brief The one mapper, made on the first call as a child of the application object.
    static HmiValueMapper* instance();
    /// \brief instance() for the QML engine, which does not own it.
    static QObject* valueMapperProvider(QQmlEngine*, QJSEngine*);
    ~HmiValueMapper() override;

    /// \brief What stands for \a value, else the default of \a valueName, else an invalid variant.
    Q_INVOKABLE QVariant mappedValue(const QString& valueName, int value) const;

    /// \brief Replaces all mappings by those of a file; by none, after a warning, when it is missing or damaged.
    void loadValueMapping(const QString& filePath);

private:
    explicit HmiValueMapper(QObject* parent);

    /// All mappings, and the defaults.
    QPair<QMap<QString, QMap<int, QVariant>>, QMap<QString, QVariant>> m_valueMappings;
};

/// \brief Reads files of value mappings. Failures are warnings and give nothing.
class HMICORE_EXPORT ValueMappingProcessor
{
public:
    /// \brief The mappings and the defaults in a file; of elements with the same name the last one counts.
    static QPair<QMap<QString, QMap<int, QVariant>>, QMap<QString, QVariant>> parse(const QString& filePath);

    /// \brief The array at the top of a file, empty when there is none.
    static QJsonArray readConfigurationDocument(const QString& filePath);
};

} // namespace HmiCore
