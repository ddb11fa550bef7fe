// SPDX-License-Identifier: MIT
#include "hmiactivationoverridemanager.h"

#include <QCoreApplication>
#include <QQmlEngine>

#include <algorithm>

namespace HmiCore {

namespace {

/// What the first live override answers that is not empty.
template <typename Overrides, typename Question>
QString firstAnswer(const Overrides& overrides, Question question)
{
    for (const QPointer<HmiActivationOverride>& activationOverride : overrides) {
        const QString answer = activationOverride ? question(*activationOverride) : QString();
        if (!answer.isEmpty())
            return answer;
    }
    return QString();
}

} // namespace

HmiActivationOverrideManager* HmiActivationOverrideManager::instance()
{
    static auto* const manager = new HmiActivationOverrideManager(QCoreApplication::instance());
    return manager;
}

QObject* HmiActivationOverrideManager::activationOverrideManagerProvider(QQmlEngine*, QJSEngine*)
{
    QQmlEngine::setObjectOwnership(instance(), QQmlEngine::CppOwnership);
    return instance();
}

HmiActivationOverrideManager::HmiActivationOverrideManager(QObject* parent)
    : QObject(parent)
{
}

HmiActivationOverrideManager::~HmiActivationOverrideManager() = default;

void HmiActivationOverrideManager::registerOverride(HmiActivationOverride* activationOverride)
{
    if (!activationOverride)
        return;
    connect(activationOverride, &HmiActivationOverride::nameOverrideChanged, this,
            &HmiActivationOverrideManager::onNameOverrideChanged);
    connect(activationOverride, &HmiActivationOverride::iconOverrideChanged, this,
            &HmiActivationOverrideManager::onIconOverrideChanged);
    activationOverride->syncNameOverrides();
    activationOverride->syncIconOverrides();
    const QList<int> domains = activationOverride->overrideDomains();
    for (const int domain : domains)
        insert(m_overrides[domain], activationOverride);
}

/// Whoever is asked may register or destroy overrides, so this goes by a copy.
bool HmiActivationOverrideManager::override(int domain) const
{
    const Overrides overrides = m_overrides.value(domain);
    return std::any_of(overrides.cbegin(), overrides.cend(), [domain](const auto& activationOverride) {
        return activationOverride && activationOverride->handleOverride(domain);
    });
}

QString HmiActivationOverrideManager::nameOverride(int domain)
{
    return firstAnswer(m_nameOverrides.value(domain), [domain](const HmiActivationOverride& activationOverride) {
        return activationOverride.handleNameOverride(domain);
    });
}

QString HmiActivationOverrideManager::iconOverride(int domain, const QString& postfix)
{
    return firstAnswer(m_iconOverrides.value(domain),
                       [domain, &postfix](const HmiActivationOverride& activationOverride) {
                           return activationOverride.handleIconOverride(domain, postfix);
                       });
}

QList<int> HmiActivationOverrideManager::nameOverrides() const
{
    return m_nameOverrides.keys();
}

QList<int> HmiActivationOverrideManager::iconOverrides() const
{
    return m_iconOverrides.keys();
}

void HmiActivationOverrideManager::onNameOverrideChanged(int domain, bool active, HmiActivationOverride* overide)
{
    if (change(m_nameOverrides, domain, active, overide))
        Q_EMIT nameOverridesChanged();
}

void HmiActivationOverrideManager::onIconOverrideChanged(int domain, bool active, HmiActivationOverride* overide)
{
    if (change(m_iconOverrides, domain, active, overide))
        Q_EMIT iconOverridesChanged();
}

/// By falling priority. Those that are gone have none and go to the end, where they are in nobody's way.
void HmiActivationOverrideManager::insert(Overrides& overrides, HmiActivationOverride* activationOverride)
{
    overrides.append(activationOverride);
    const auto gone =
        std::stable_partition(overrides.begin(), overrides.end(), [](const auto& each) { return !each.isNull(); });
    std::stable_sort(overrides.begin(), gone,
                     [](const auto& a, const auto& b) { return a->priority() > b->priority(); });
}

/// False when there is nothing to tell of.
bool HmiActivationOverrideManager::change(QMap<int, Overrides>& map, int domain, bool active,
                                          HmiActivationOverride* activationOverride)
{
    if (active) {
        insert(map[domain], activationOverride);
        return true;
    }
    const auto overrides = map.find(domain);
    if (overrides == map.end())
        return false;
    overrides->removeAll(activationOverride);
    if (overrides->isEmpty())
        map.erase(overrides);
    return true;
}

} // namespace HmiCore
