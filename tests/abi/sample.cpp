// SPDX-License-Identifier: MIT
#include "sample.h"

namespace HmiCore {

Base::~Base() = default;

int Base::count() const
{
    return static_cast<int>(m_count);
}

#ifndef REMOVED_FUNCTION
void Base::clear()
{
    m_count = 0;
}
#endif

#ifdef CHANGED_SIGNATURE
void Base::add(long amount)
#else
void Base::add(int amount)
#endif
{
    m_count += amount;
    added();
}

#ifdef ADDED_FUNCTION
void Base::addTwice(int amount)
{
    add(2 * amount);
}
#endif

void Base::added() {}

#ifndef REMOVED_VIRTUAL
void Base::removed() {}
#endif

Derived::~Derived() = default;

Derived::Kind Derived::kind() const
{
    return Small;
}

void use(Interface& interface)
{
    interface.close();
}

} // namespace HmiCore
