// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QObject>
#include <QString>

namespace HmiCore {

/// \brief Lets a module change how another one, named by its domain, is called, drawn and activated.
///
/// Derive from it, say in the constructor which domains may be taken over, and register it with HmiActivationOverrideManager.
/// It is owned by the module and may be destroyed at any time; it then counts no more. GUI thread only.
class HMICORE_EXPORT HmiActivationOverride : public QObject
{
    Q_OBJECT

public:
    explicit HmiActivationOverride(QObject* parent = nullptr);
    ~HmiActivationOverride() override;

    /// \brief Overrides of higher priority are asked first. It must not change once the override is registered; -1 by default.
    virtual int priority() const;
    /// \brief Somebody wants to activate \a domain. True when that is done here, so that nobody else does it.
    virtual bool handleOverride(int domain) = 0;
    /// \brief The name of \a domain; empty lets overrides of lower priority speak.
    virtual QString handleNameOverride(int domain) const;
    /// \brief The icon of \a domain in the variant that \a postfix names; empty lets overrides of lower priority speak.
    virtual QString handleIconOverride(int domain, const QString& postfix) const;

    void syncNameOverrides(); ///< tells of each active name override once more
    void syncIconOverrides(); ///< tells of each active icon override once more

Q_SIGNALS:
    /// \brief The name of \a domain is overridden, or no longer is. The last argument is spelt as QML knows it.
    void nameOverrideChanged(int domain, bool active, HmiCore::HmiActivationOverride* overide);
    /// \brief As nameOverrideChanged(), of the icon.
    void iconOverrideChanged(int domain, bool active, HmiCore::HmiActivationOverride* overide);

protected Q_SLOTS:
    // Each tells of a change only; a domain counts once. None needs addOverrideDomain().
    void activateNameOverride(int domain);   ///< handleNameOverride() counts from now on
    void activateIconOverride(int domain);   ///< handleIconOverride() counts from now on
    void deactivateNameOverride(int domain); ///< handleNameOverride() counts no more
    void deactivateIconOverride(int domain); ///< handleIconOverride() counts no more
    /// \brief Lets handleOverride() be asked for \a domain. Only what is added before the registration counts.
    void addOverrideDomain(int domain);
    QList<int> overrideDomains(); ///< in the order in which they were added

private:
    friend class HmiActivationOverrideManager;

    QList<int> m_overrideDomains;
    QList<int> m_activeNameOverrides;
    QList<int> m_activeIconOverrides;
};

} // namespace HmiCore
