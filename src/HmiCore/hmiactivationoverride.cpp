// SPDX-License-Identifier: MIT
#include "hmiactivationoverride.h"

namespace HmiCore {

namespace {

/// False when \a domain was there before.
bool add(QList<int>& domains, int domain)
{
    if (domains.contains(domain))
        return false;
    domains.append(domain);
    return true;
}

} // namespace

HmiActivationOverride::HmiActivationOverride(QObject* parent)
    : QObject(parent)
{
}

HmiActivationOverride::~HmiActivationOverride() = default;

int HmiActivationOverride::priority() const
{
    return -1;
}

QString HmiActivationOverride::handleNameOverride(int /*domain*/) const
{
    return QString();
}

QString HmiActivationOverride::handleIconOverride(int /*domain*/, const QString& /*postfix*/) const
{
    return QString();
}

void HmiActivationOverride::syncNameOverrides()
{
    const QList<int> domains = m_activeNameOverrides;
    for (const int domain : domains)
        Q_EMIT nameOverrideChanged(domain, true, this);
}

void HmiActivationOverride::syncIconOverrides()
{
    const QList<int> domains = m_activeIconOverrides;
    for (const int domain : domains)
        Q_EMIT iconOverrideChanged(domain, true, this);
}

void HmiActivationOverride::activateNameOverride(int domain)
{
    if (add(m_activeNameOverrides, domain))
        Q_EMIT nameOverrideChanged(domain, true, this);
}

void HmiActivationOverride::activateIconOverride(int domain)
{
    if (add(m_activeIconOverrides, domain))
        Q_EMIT iconOverrideChanged(domain, true, this);
}

void HmiActivationOverride::deactivateNameOverride(int domain)
{
    if (m_activeNameOverrides.removeOne(domain))
        Q_EMIT nameOverrideChanged(domain, false, this);
}

void HmiActivationOverride::deactivateIconOverride(int domain)
{
    if (m_activeIconOverrides.removeOne(domain))
        Q_EMIT iconOverrideChanged(domain, false, this);
}

void HmiActivationOverride::addOverrideDomain(int domain)
{
    add(m_overrideDomains, domain);
}

QList<int> HmiActivationOverride::overrideDomains()
{
    return m_overrideDomains;
}

} // namespace HmiCore
