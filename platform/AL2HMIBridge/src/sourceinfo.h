// SPDX-License-Identifier: MIT
#pragma once

#include "bridgeendpoint.h"

#include <QLatin1String>
#include <QList>
#include <QObject>
#include <QString>
#include <QVariantList>

#include <variant>
#include <vector>

namespace AL2HMIBridge {

/// A decoded value; enumerations travel as int.
using Value = std::variant<bool, int, double, QString, QList<int>, QVariantList>;

enum class ValueType { Bool, Int, Real, Text, IntList, Records };

/// A table that stands in constant memory.
template <class T>
struct Rows
{
    const T* first = nullptr;
    int count = 0;

    const T* begin() const { return first; }
    const T* end() const { return first + count; }
};

struct Record;

struct ValueShape
{
    ValueType type;
    double minimum;  ///< of a number; 0 for texts and lists
    double maximum;  ///< of a number; of the length of a text or list
    Rows<int> known; ///< the only numbers allowed, when there are any
    const Record* record;
};

struct Argument
{
    QLatin1String name;
    ValueShape shape;
};

struct Record
{
    QLatin1String name;
    Rows<Argument> fields;
};

struct Field
{
    QLatin1String name;
    ValueShape shape;
    Value (*initial)();
    bool (*store)(QObject* source, Value& value); ///< true when the value differs from the one before
    void (*notify)(QObject* source);
};

struct Event
{
    QLatin1String name;
    Rows<Argument> arguments;
    void (*emitTo)(QObject* receiver, const std::vector<Value>& values);
};

struct SourceInfo
{
    QLatin1String name;
    BridgeEndpoint::Channel channel;
    const SourceInfo* base;
    Rows<Field> fields;
    Rows<Event> events;
    QObject* (*instance)(); ///< GUI thread only; null for an abstract source
};

struct Language
{
    int id;
    QLatin1String locale;
    const char* name; ///< UTF-8, in the language itself
};

struct SourceTable
{
    static Rows<const SourceInfo*> all();
    static Rows<Language> languages();

    /// Null when there is none of this name.
    static const SourceInfo* find(const QString& name);
    static const Field* findField(const SourceInfo& source, const QString& name);
    static const Event* findEvent(const SourceInfo& source, const QString& name);

    /// Calls \a visit with every field of a source, those of its bases included.
    template <class Visit>
    static void forEachField(const SourceInfo& source, Visit visit)
    {
        for (const SourceInfo* part = &source; part; part = part->base)
            for (const Field& field : part->fields)
                visit(field);
    }
};

} // namespace AL2HMIBridge
