// SPDX-License-Identifier: MIT
// A small library whose interface changes with what is defined: once as it is recorded, once per change.
#pragma once

#include <qglobal.h>

namespace HmiCore {

class Q_DECL_EXPORT Base
{
public:
    virtual ~Base();

    int count() const;
#ifndef REMOVED_FUNCTION
    void clear();
#endif
#ifdef CHANGED_SIGNATURE
    void add(long amount);
#else
    void add(int amount);
#endif
#ifdef ADDED_FUNCTION
    void addTwice(int amount);
#endif

protected:
#ifdef REORDERED_VIRTUALS
    virtual void removed();
    virtual void added();
#else
    virtual void added();
#ifndef REMOVED_VIRTUAL
    virtual void removed();
#endif
#endif
#ifdef ADDED_VIRTUAL
    virtual void cleared() = 0;
#endif

private:
#ifdef ADDED_MEMBER
    int m_limit = 0;
#endif
#ifdef CHANGED_MEMBER
    long m_count = 0;
#else
    int m_count = 0;
#endif
};

#ifdef CHANGED_BASE
class Q_DECL_EXPORT Derived
#else
class Q_DECL_EXPORT Derived : public Base
#endif
{
public:
#ifdef CHANGED_VALUE
    enum Kind{None, Small, Large};
#else
    enum Kind { Small, Large };
#endif
    virtual ~Derived();
    virtual Kind kind() const;
};

/// \brief Has no code in the library.
class Interface
{
public:
    virtual ~Interface() = default;
    virtual void open() = 0;
#ifdef CHANGED_INTERFACE
    virtual bool isOpen() const = 0;
#endif
    virtual void close() = 0;
};

Q_DECL_EXPORT void use(Interface& interface);

} // namespace HmiCore
