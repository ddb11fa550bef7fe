// SPDX-License-Identifier: MIT
#pragma once

#include "hmiactivationoverride.h"
#include "hmicore_export.h"

#include <QList>
#include <QMap>
#include <QObject>
#include <QPointer>
#include <QString>

QT_BEGIN_NAMESPACE
class QJSEngine;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief Combines what modules override of each other, by priority.
///
/// QML knows it as the singleton `HmiOverrides` of the module of the same name. Overrides are not owned; those that are
/// destroyed are passed over. GUI thread only.
class HMICORE_EXPORT HmiActivationOverrideManager : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QList<int> nameOverrides READ nameOverrides NOTIFY nameOverridesChanged)
    Q_PROPERTY(QList<int> iconOverrides READ iconOverrides NOTIFY iconOverridesChanged)

public:
    /// \brief The one manager, made on the first call as a child of the application object and gone with it.
    static HmiActivationOverrideManager* instance();
    /// \brief What QML gets as the singleton. It stays the application object's.
    static QObject* activationOverrideManagerProvider(QQmlEngine* engine, QJSEngine* scriptEngine);
    ~HmiActivationOverrideManager() override;

    /// \brief Takes an override in, with what it has activated already. Null is ignored; there is no way back, and twice is twice.
    void registerOverride(HmiActivationOverride* activationOverride);

    /// \brief Offers the activation of \a domain to its overrides. True when one took it over: then the caller leaves it alone.
    bool override(int domain) const;

    /// \brief The name for \a domain; empty when nobody overrides it.
    Q_INVOKABLE QString nameOverride(int domain);
    /// \brief The icon for \a domain; empty when nobody overrides it. \a postfix names a variant to the overrides.
    Q_INVOKABLE QString iconOverride(int domain, const QString& postfix);

    QList<int> nameOverrides() const; ///< domains whose names are overridden, ascending
    QList<int> iconOverrides() const; ///< domains whose icons are overridden, ascending

Q_SIGNALS:
    void nameOverridesChanged();
    void iconOverridesChanged();

private Q_SLOTS:
    void onNameOverrideChanged(int domain, bool active, HmiCore::HmiActivationOverride* overide);
    void onIconOverrideChanged(int domain, bool active, HmiCore::HmiActivationOverride* overide);

private:
    using Overrides = QList<QPointer<HmiActivationOverride>>;

    explicit HmiActivationOverrideManager(QObject* parent);

    static void insert(Overrides& overrides, HmiActivationOverride* activationOverride);
    static bool change(QMap<int, Overrides>& map, int domain, bool active, HmiActivationOverride* activationOverride);

    QMap<int, Overrides> m_overrides;
    QMap<int, Overrides> m_nameOverrides;
    QMap<int, Overrides> m_iconOverrides;
};

} // namespace HmiCore
