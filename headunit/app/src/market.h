// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>
#include <QVariant>

/// \brief The market that the vehicle is made for: what its country means for languages, units and sources. GUI thread only.
///
/// It reads `markets/`, `regions/` and `valuemappings.json` of the HMI's main folder into the stores of the core.
class Market : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString languageBundle READ languageBundle NOTIFY changed)
    Q_PROPERTY(bool twelveHourClock READ twelveHourClock NOTIFY changed)
    Q_PROPERTY(QString temperatureUnit READ temperatureUnit NOTIFY changed)
    Q_PROPERTY(QString distanceUnit READ distanceUnit NOTIFY changed)

public:
    explicit Market(QObject* parent);

    QString languageBundle() const;  ///< empty when the market has none
    bool twelveHourClock() const;    ///< with morning and afternoon
    QString temperatureUnit() const; ///< "celsius" or "fahrenheit"
    QString distanceUnit() const;    ///< "km" or "mile"

    /// \brief Whether a source of sound, by its number, can be received or bought there. Without a list all can.
    bool offersSource(int audioSource) const;

    /// \brief A temperature in the market's unit.
    Q_INVOKABLE QString temperature(double celsius) const;
    /// \brief A time of day as the market tells it; \a hoursAndMinutes as the vehicle does, such as "16:45".
    Q_INVOKABLE QString clock(const QString& hoursAndMinutes) const;

Q_SIGNALS:
    /// \brief Another country.
    void changed();

private:
    static QVariant property(const char* name);
    static QVariant regionProperty(const char* name);
};
