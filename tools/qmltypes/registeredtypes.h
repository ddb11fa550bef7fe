// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QList>
#include <QString>

struct QMetaObject;

/// \brief One type that was registered for QML in this process.
struct RegisteredType
{
    QString module;
    int majorVersion = 0;
    int minorVersion = 0;
    QString name; ///< in QML; empty for a type that is only known to exist
    const QMetaObject* metaObject = nullptr;
    bool isSingleton = false;
    bool isCreatable = false;
    QString whyNotCreatable; ///< what QML tells who tries; empty for singletons and creatable types
};

/// \brief The object types of \a modules, in the order in which they were registered.
QList<RegisteredType> registeredTypes(const QStringList& modules);

/// \brief The type description (the content of a `plugins.qmltypes`) of \a types, which are those of one module.
QByteArray typeDescription(const QList<RegisteredType>& types);

/// \brief Writes `DIR/<module>/plugins.qmltypes` and `qmldir` for each of \a modules.
///
/// False, with a message in \a error, when a module has no types or a file cannot be written.
bool writeDescriptions(const QString& directory, const QStringList& modules, QString* error);
