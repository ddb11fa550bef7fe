// SPDX-License-Identifier: MIT
#include "sourceinfo.h"

namespace AL2HMIBridge {

namespace {

template <class T>
const T* findByName(Rows<T> rows, const QString& name)
{
    for (const T& row : rows)
        if (row.name == name)
            return &row;
    return nullptr;
}

} // namespace

const SourceInfo* SourceTable::find(const QString& name)
{
    for (const SourceInfo* const source : all())
        if (source->name == name)
            return source;
    return nullptr;
}

const Field* SourceTable::findField(const SourceInfo& source, const QString& name)
{
    for (const SourceInfo* part = &source; part; part = part->base)
        if (const Field* const field = findByName(part->fields, name))
            return field;
    return nullptr;
}

const Event* SourceTable::findEvent(const SourceInfo& source, const QString& name)
{
    for (const SourceInfo* part = &source; part; part = part->base)
        if (const Event* const event = findByName(part->events, name))
            return event;
    return nullptr;
}

} // namespace AL2HMIBridge
