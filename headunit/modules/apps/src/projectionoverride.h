// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiActivationOverride>

#include <QList>

class ProjectionPresence;

/// \brief While a phone projects its screen, the tiles of phone and navigation are the phone's: its name, its icon, and a press
/// leads to its screen. GUI thread only.
class ProjectionOverride : public HmiCore::HmiActivationOverride
{
    Q_OBJECT

public:
    /// \brief \a presence outlives it.
    ProjectionOverride(const ProjectionPresence* presence, QObject* parent);

    int priority() const override;
    bool handleOverride(int domain) override;
    QString handleNameOverride(int domain) const override;
    QString handleIconOverride(int domain, const QString& postfix) const override;

private:
    void update();

    const ProjectionPresence* const m_presence;
    QString m_phone; ///< by which the names were told last; null while there is none
};
