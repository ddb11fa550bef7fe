// SPDX-License-Identifier: MIT
#pragma once

#include "sourceinfo.h"

#include <type_traits>
#include <utility>

namespace AL2HMIBridge {

template <class C, class T>
C* classOf(T C::*);
template <class C, class T>
T typeOf(T C::*);

/// As Value holds it.
template <class T>
using Stored = std::conditional_t<std::is_enum_v<T>, int, T>;

/// The decoder checked the alternative against the table, from which both come.
template <class T>
T take(Value& value)
{
    return static_cast<T>(std::move(*std::get_if<Stored<T>>(&value)));
}

template <auto Member>
bool store(QObject* source, Value& value)
{
    using Class = std::remove_pointer_t<decltype(classOf(Member))>;
    using Type = decltype(typeOf(Member));
    Type& member = static_cast<Class*>(source)->*Member;
    Type next = take<Type>(value);
    if (member == next)
        return false;
    member = std::move(next);
    return true;
}

template <class Class>
void emitSignal(QObject* receiver, void (Class::*signal)(), const std::vector<Value>&)
{
    Q_EMIT(static_cast<Class*>(receiver)->*signal)();
}

template <class Class>
void emitSignal(QObject* receiver, void (Class::*signal)(int), const std::vector<Value>& values)
{
    Q_EMIT(static_cast<Class*>(receiver)->*signal)(*std::get_if<int>(&values[0]));
}

template <class Class>
void emitSignal(QObject* receiver, void (Class::*signal)(int, int), const std::vector<Value>& values)
{
    Q_EMIT(static_cast<Class*>(receiver)->*signal)(*std::get_if<int>(&values[0]), *std::get_if<int>(&values[1]));
}

template <auto Signal>
void notify(QObject* source)
{
    emitSignal(source, Signal, {});
}

template <auto Signal>
void emitEvent(QObject* receiver, const std::vector<Value>& values)
{
    emitSignal(receiver, Signal, values);
}

} // namespace AL2HMIBridge
