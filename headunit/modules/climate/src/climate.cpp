// SPDX-License-Identifier: MIT
#include "climate.h"

#include "units.h"

#include <AL2HMIBridge/GlobalSource>

#include <algorithm>
#include <cmath>

using AL2HMIBridge::GlobalSource;

namespace {

constexpr double degreesPerFanStep = 4; ///< that it is too warm or too cold outside

double toFahrenheit(double celsius)
{
    return celsius * 9 / 5 + 32;
}

double toCelsius(double fahrenheit)
{
    return (fahrenheit - 32) * 5 / 9;
}

} // namespace

Climate::Climate(QObject* parent)
    : QObject(parent)
{
    const auto adapt = [this] {
        regulate();
        Q_EMIT changed();
    };
    connect(GlobalSource::instance(), &GlobalSource::outsideTemperatureChanged, this, adapt);
    connect(GlobalSource::instance(), &GlobalSource::destinationCountryChanged, this, &Climate::changed);
    regulate();
}

QString Climate::unit() const
{
    return Units::isFahrenheit() ? QStringLiteral("°F") : QStringLiteral("°C");
}

QString Climate::temperatureText(Zone zone) const
{
    if (Units::isFahrenheit())
        return QString::number(qRound(toFahrenheit(m_temperatures[zone])));
    return Units::number(m_temperatures[zone], 1);
}

void Climate::alter(Setting setting, Zone zone)
{
    regulate();
    Q_EMIT changed();
    Q_EMIT altered(setting, zone);
}

/// The automatic: the farther the air outside is from the temperature that is wanted, the more of it.
void Climate::regulate()
{
    if (!m_now.automatic || m_defrosting)
        return;
    const double difference = m_temperatures[Driver] - GlobalSource::instance()->outsideTemperature();
    m_now.fan = std::clamp(1 + int(std::abs(difference) / degreesPerFanStep), 1, highestFanStep - 1);
    m_now.air = difference > degreesPerFanStep ? Windscreen | Feet : Face;
}

void Climate::setOn(bool on)
{
    if (on == m_now.on)
        return;
    endDefrosting();
    m_now.on = on;
    alter(Power);
}

void Climate::setFan(int fan)
{
    const int step = std::clamp(fan, 1, highestFanStep);
    if (step == m_now.fan && m_now.on)
        return;
    endDefrosting();
    m_now.on = true;
    m_now.automatic = false;
    m_now.fan = step;
    alter(Fan);
}

void Climate::setAutomatic(bool automatic)
{
    if (automatic == m_now.automatic && m_now.on)
        return;
    endDefrosting();
    m_now.on = true;
    m_now.automatic = automatic;
    m_now.cooling = m_now.cooling || automatic;
    alter(Automatic);
}

void Climate::setCooling(bool cooling)
{
    if (cooling == m_now.cooling)
        return;
    m_now.cooling = cooling;
    alter(Cooling);
}

void Climate::setRecirculating(bool recirculating)
{
    if (recirculating == m_now.recirculating)
        return;
    endDefrosting();
    m_now.recirculating = recirculating;
    alter(Recirculation);
}

void Climate::setDefrosting(bool defrosting)
{
    if (defrosting == m_defrosting)
        return;
    if (defrosting) {
        m_before = m_now;
        m_now = {true, false, true, false, highestFanStep, Windscreen};
        m_defrosting = true;
    } else {
        endDefrosting();
    }
    alter(Defrost);
}

void Climate::endDefrosting()
{
    if (!m_defrosting)
        return;
    m_defrosting = false;
    m_now = m_before;
}

void Climate::setRearDefrosting(bool defrosting)
{
    if (defrosting == m_rearDefrosting)
        return;
    m_rearDefrosting = defrosting;
    alter(RearDefrost);
}

void Climate::setSynchronous(bool synchronous)
{
    if (synchronous == m_synchronous)
        return;
    m_synchronous = synchronous;
    if (synchronous)
        m_temperatures[Passenger] = m_temperatures[Driver];
    alter(Sync);
}

void Climate::setTemperature(Zone zone, double celsius)
{
    const double kept = std::clamp(celsius, lowest, highest);
    if (kept == m_temperatures[zone])
        return;
    m_temperatures[zone] = kept;
    if (zone == Passenger)
        m_synchronous = false;
    else if (m_synchronous)
        m_temperatures[Passenger] = kept;
    alter(Temperature, zone);
}

void Climate::stepTemperature(Zone zone, int steps)
{
    const double now = m_temperatures[zone];
    setTemperature(zone, Units::isFahrenheit() ? toCelsius(qRound(toFahrenheit(now)) + steps)
                                               : (qRound(now * 2) + steps) / 2.0);
}

void Climate::stepSeat(Zone zone)
{
    m_seats[zone] = (m_seats[zone] + 1) % (highestSeatStep + 1);
    alter(Seat, zone);
}

void Climate::toggleAir(Direction direction)
{
    const int air = m_now.air ^ direction;
    if (air == 0)
        return;
    endDefrosting();
    m_now.on = true;
    m_now.automatic = false;
    m_now.air = air;
    alter(Air);
}
