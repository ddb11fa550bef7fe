// SPDX-License-Identifier: MIT
#pragma once

#include "destinationmodel.h"
#include "route.h"
#include "stepmodel.h"
#include "streetgraph.h"
#include "town.h"

#include <QElapsedTimer>
#include <QObject>
#include <QTimer>

/// \brief Where the vehicle is, where it goes, and what to do next. GUI thread only.
///
/// The bridge reports no position. This stands in for a maker's positioning and routing: the vehicle stands still in the
/// town until the driver starts the demonstration, which then drives it along the route in quick motion.
class Navigator : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QPointF position READ position NOTIFY moved)
    Q_PROPERTY(double heading READ heading NOTIFY moved)
    Q_PROPERTY(QString townName READ townName CONSTANT)
    Q_PROPERTY(bool active READ isActive NOTIFY routeChanged)
    Q_PROPERTY(QString destination READ destination NOTIFY routeChanged)
    Q_PROPERTY(bool driving READ isDriving NOTIFY drivingChanged)
    Q_PROPERTY(QString turnIcon READ turnIcon NOTIFY guidanceChanged)
    Q_PROPERTY(QString turnText READ turnText NOTIFY guidanceChanged)
    Q_PROPERTY(QString turnStreet READ turnStreet NOTIFY guidanceChanged)
    Q_PROPERTY(QString turnDistance READ turnDistance NOTIFY guidanceChanged)
    Q_PROPERTY(QString remaining READ remaining NOTIFY guidanceChanged)
    Q_PROPERTY(QString remainingTime READ remainingTime NOTIFY guidanceChanged)
    Q_PROPERTY(QString arrival READ arrival NOTIFY guidanceChanged)
    Q_PROPERTY(bool avoidMotorways READ avoidMotorways WRITE setAvoidMotorways NOTIFY avoidMotorwaysChanged)
    Q_PROPERTY(DestinationModel* destinations READ destinations CONSTANT)
    Q_PROPERTY(StepModel* steps READ steps CONSTANT)

public:
    Navigator(std::shared_ptr<const Town> town, QObject* parent);

    const std::shared_ptr<const Town>& town() const { return m_town; }
    const Route& route() const { return m_route; } ///< empty without a destination

    QPointF position() const { return m_position; }
    double heading() const { return m_heading; } ///< degrees, clockwise from the north
    QString townName() const { return m_town->name; }
    bool isActive() const { return !m_route.isEmpty(); }
    QString destination() const { return m_destination; }
    bool isDriving() const { return m_timer.isActive(); }
    QString turnIcon() const;
    QString turnText() const;
    QString turnStreet() const;   ///< that the next manoeuvre leads into; the destination when it is the last
    QString turnDistance() const; ///< to the next manoeuvre
    double metresToTurn() const;
    int nextStep() const { return m_nextStep; } ///< row of the next manoeuvre in the route's steps
    QString remaining() const;                  ///< way to the destination
    QString remainingTime() const;
    QString arrival() const; ///< hours and minutes as the vehicle tells them, such as "16:45"; empty when it tells none
    bool avoidMotorways() const { return m_avoidMotorways; }
    void setAvoidMotorways(bool avoid); ///< an active route is found anew
    DestinationModel* destinations() { return &m_destinations; }
    StepModel* steps() { return &m_steps; }

    /// \brief Row of the place that is meant by \a words: its name, or the start of it, in any case; -1 when there is none.
    int findPlace(const QString& words) const;

    /// \brief Guides to a place, by its row in Town::places. False when there is none, or no way to it.
    Q_INVOKABLE bool navigateTo(int place);
    /// \brief Ends the guidance. Without effect when there is none.
    Q_INVOKABLE void stop();
    /// \brief Starts or pauses the demonstration; without a route it stays off.
    Q_INVOKABLE void setDriving(bool driving);
    /// \brief Drives on for \a seconds of the demonstration's time.
    void advance(double seconds);

Q_SIGNALS:
    void moved();
    void routeChanged();
    void drivingChanged();
    void guidanceChanged();
    void avoidMotorwaysChanged();
    void arrived();

private:
    const RouteStep* next() const;
    void follow(const Route& route);
    void moveTo(double metres);
    void retranslate();

    const std::shared_ptr<const Town> m_town;
    const StreetGraph m_graph;
    DestinationModel m_destinations;
    StepModel m_steps;
    QTimer m_timer;
    QElapsedTimer m_clock; ///< since the last advance()
    QPointF m_position;
    double m_heading;
    Route m_route;
    QString m_destination;
    int m_place = -1;
    double m_driven = 0; ///< metres of the route
    int m_nextStep = 0;
    bool m_avoidMotorways = false;
};
