// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

/// \brief The air conditioning: two zones, fan, air distribution, heated seats. GUI thread only.
///
/// The bridge knows nothing of it. This stands in for a maker's climate control unit: it has that unit's rules (what the
/// automatic does, what defrosting changes), but no air. A maker connects it to the unit and keeps its properties.
class Climate : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool on READ isOn WRITE setOn NOTIFY changed)
    Q_PROPERTY(QString driverTemperature READ driverTemperature NOTIFY changed)
    Q_PROPERTY(QString passengerTemperature READ passengerTemperature NOTIFY changed)
    Q_PROPERTY(QString unit READ unit NOTIFY changed)
    Q_PROPERTY(int driverSeat READ driverSeat NOTIFY changed)
    Q_PROPERTY(int passengerSeat READ passengerSeat NOTIFY changed)
    Q_PROPERTY(int fan READ fan WRITE setFan NOTIFY changed)
    Q_PROPERTY(int highestFan READ highestFan CONSTANT)
    Q_PROPERTY(int air READ air NOTIFY changed)
    Q_PROPERTY(bool automatic READ isAutomatic WRITE setAutomatic NOTIFY changed)
    Q_PROPERTY(bool cooling READ isCooling WRITE setCooling NOTIFY changed)
    Q_PROPERTY(bool recirculating READ isRecirculating WRITE setRecirculating NOTIFY changed)
    Q_PROPERTY(bool defrosting READ isDefrosting WRITE setDefrosting NOTIFY changed)
    Q_PROPERTY(bool rearDefrosting READ isRearDefrosting WRITE setRearDefrosting NOTIFY changed)
    Q_PROPERTY(bool synchronous READ isSynchronous WRITE setSynchronous NOTIFY changed)

public:
    enum Zone { Driver, Passenger };
    Q_ENUM(Zone)
    enum Direction { Windscreen = 1, Face = 2, Feet = 4 }; ///< of the air; several at once
    Q_ENUM(Direction)
    enum Setting { Power, Temperature, Seat, Fan, Air, Automatic, Cooling, Recirculation, Defrost, RearDefrost, Sync };
    Q_ENUM(Setting)

    static constexpr double lowest = 16; ///< degrees Celsius
    static constexpr double highest = 28;
    static constexpr int highestFanStep = 7;
    static constexpr int highestSeatStep = 3;

    explicit Climate(QObject* parent);

    bool isOn() const { return m_now.on; }
    void setOn(bool on);
    double temperature(Zone zone) const { return m_temperatures[zone]; }  ///< degrees Celsius
    QString driverTemperature() const { return temperatureText(Driver); } ///< in unit()
    QString passengerTemperature() const { return temperatureText(Passenger); }
    QString unit() const;                              ///< that of the market
    int driverSeat() const { return m_seats[Driver]; } ///< 0 off to 3
    int passengerSeat() const { return m_seats[Passenger]; }
    int fan() const { return m_now.fan; } ///< 1 to 7
    void setFan(int fan);                 ///< ends the automatic; switches on
    int highestFan() const { return highestFanStep; }
    int air() const { return m_now.air; } ///< bits of Direction, at least one
    bool isAutomatic() const { return m_now.automatic; }
    void setAutomatic(bool automatic); ///< switches on; chooses fan and air by what the temperature outside asks for
    bool isCooling() const { return m_now.cooling; }
    void setCooling(bool cooling);
    bool isRecirculating() const { return m_now.recirculating; }
    void setRecirculating(bool recirculating); ///< ends defrosting, which needs air from outside
    bool isDefrosting() const { return m_defrosting; }
    void setDefrosting(bool defrosting); ///< all air to the windscreen; afterwards everything is as it was
    bool isRearDefrosting() const { return m_rearDefrosting; }
    void setRearDefrosting(bool defrosting);
    bool isSynchronous() const { return m_synchronous; }
    void setSynchronous(bool synchronous); ///< the passenger's zone follows the driver's

    /// \brief Sets a zone to \a celsius, kept within the limits.
    void setTemperature(Zone zone, double celsius);
    /// \brief Changes a zone by half degrees Celsius or whole degrees Fahrenheit, as the market counts.
    Q_INVOKABLE void stepTemperature(Climate::Zone zone, int steps);
    /// \brief The next step of a heated seat, after the highest off.
    Q_INVOKABLE void stepSeat(Climate::Zone zone);
    /// \brief Sends air in a direction or no longer; the last direction stays. Ends the automatic.
    Q_INVOKABLE void toggleAir(Climate::Direction direction);

Q_SIGNALS:
    void changed();
    /// \brief Somebody has changed a setting; \a zone is that of the setting if it has zones.
    void altered(Climate::Setting setting, Climate::Zone zone);

private:
    struct Flow ///< what defrosting changes and restores
    {
        bool on = true;
        bool automatic = true;
        bool cooling = true;
        bool recirculating = false;
        int fan = 2;
        int air = Face;
    };

    QString temperatureText(Zone zone) const;
    void alter(Setting setting, Zone zone = Driver);
    void endDefrosting();
    void regulate();

    Flow m_now;
    Flow m_before; ///< defrosting
    double m_temperatures[2] = {21.5, 21.5};
    int m_seats[2] = {0, 0};
    bool m_defrosting = false;
    bool m_rearDefrosting = false;
    bool m_synchronous = true;
};
