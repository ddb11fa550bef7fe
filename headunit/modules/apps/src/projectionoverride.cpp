// SPDX-License-Identifier: MIT
#include "projectionoverride.h"

#include "../../moduledomains.h"
#include "projectionpresence.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiManager>

using HmiCore::HmiIntentManager;

namespace {

constexpr int domains[] = {ModuleDomain::Phone, ModuleDomain::Navigation};

} // namespace

ProjectionOverride::ProjectionOverride(const ProjectionPresence* presence, QObject* parent)
    : HmiActivationOverride(parent)
    , m_presence(presence)
{
    for (const int domain : domains)
        addOverrideDomain(domain);
    connect(presence, &ProjectionPresence::changed, this, &ProjectionOverride::update);
    // What the names are in another language is asked for only when somebody tells of a change.
    connect(HmiCore::HmiManager::instance(), &HmiCore::HmiManager::hmiRetranslated, this, [this] {
        m_phone.clear();
        update();
    });
    update();
}

int ProjectionOverride::priority() const
{
    return 10;
}

bool ProjectionOverride::handleOverride(int /*domain*/)
{
    return m_presence->isConnected() && HmiIntentManager::instance()->requestAction(HmiIntentManager::ShowProjection);
}

/// What a phone is called is nothing to translate; one without a name keeps the modules' own.
QString ProjectionOverride::handleNameOverride(int domain) const
{
    return domain == ModuleDomain::Navigation ? tr("Maps") : m_presence->phoneName();
}

QString ProjectionOverride::handleIconOverride(int domain, const QString& /*postfix*/) const
{
    return domain == ModuleDomain::Phone ? QStringLiteral("image://hmiimages/projection-phone")
                                         : QStringLiteral("image://hmiimages/projection-navigation");
}

/// Names are told of only when they begin or end: so another name is an end and a beginning.
void ProjectionOverride::update()
{
    const QString phone = m_presence->isConnected() ? m_presence->phoneName() + QLatin1Char(' ') : QString();
    if (phone == m_phone)
        return;
    m_phone = phone;
    for (const int domain : domains) {
        deactivateNameOverride(domain);
        deactivateIconOverride(domain);
        if (m_phone.isEmpty())
            continue;
        activateNameOverride(domain);
        activateIconOverride(domain);
    }
}
