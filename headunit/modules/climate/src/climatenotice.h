// SPDX-License-Identifier: MIT
#pragma once

#include "climate.h"

/// \brief What was changed last, told in the status bar's transient `CLIMATE.Change` on screens other than that of the climate.
/// GUI thread only.
class ClimateNotice : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString icon READ icon NOTIFY changed)
    Q_PROPERTY(QString text READ text NOTIFY changed)
    Q_PROPERTY(QString value READ value NOTIFY changed)

public:
    ClimateNotice(Climate* climate, QObject* parent);

    QString icon() const;
    QString text() const;  ///< name of the setting
    QString value() const; ///< what it is now

Q_SIGNALS:
    void changed();

private:
    void tell(Climate::Setting setting, Climate::Zone zone);
    QString onOrOff(bool on) const { return on ? tr("On") : tr("Off"); }

    Climate* const m_climate;
    Climate::Setting m_setting = Climate::Power;
    Climate::Zone m_zone = Climate::Driver;
};
