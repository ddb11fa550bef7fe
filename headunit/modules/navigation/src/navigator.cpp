// SPDX-License-Identifier: MIT
#include "navigator.h"

#include "manoeuvres.h"
#include "units.h"

#include <AL2HMIBridge/GlobalSource>
#include <HmiCore/HmiManager>

#include <QTime>

#include <algorithm>
#include <utility>

using AL2HMIBridge::GlobalSource;

namespace {

constexpr int tick = 100;         ///< ms between two positions of the demonstration
constexpr double quickMotion = 3; ///< times as fast as one may drive
constexpr double longestStep = 1; ///< seconds; a screen that hung does not leap ahead
const QString clockFormat = QStringLiteral("HH:mm");

} // namespace

Navigator::Navigator(std::shared_ptr<const Town> town, QObject* parent)
    : QObject(parent)
    , m_town(std::move(town))
    , m_graph(*m_town)
    , m_destinations(*m_town, this)
    , m_steps(this)
    , m_position(m_graph.onStreet(m_town->start))
    , m_heading(m_town->heading)
{
    m_timer.setInterval(tick);
    connect(&m_timer, &QTimer::timeout, this,
            [this] { advance(std::min(longestStep, double(m_clock.restart()) / 1000)); });
    connect(HmiCore::HmiManager::instance(), &HmiCore::HmiManager::hmiRetranslated, this, &Navigator::retranslate);
    connect(GlobalSource::instance(), &GlobalSource::destinationCountryChanged, this, &Navigator::retranslate);
    connect(GlobalSource::instance(), &GlobalSource::clockTextChanged, this, &Navigator::guidanceChanged);
}

void Navigator::retranslate()
{
    m_destinations.retranslate();
    m_steps.retranslate();
    Q_EMIT guidanceChanged();
}

const RouteStep* Navigator::next() const
{
    return isActive() ? &m_route.steps.at(m_nextStep) : nullptr;
}

QString Navigator::turnIcon() const
{
    const RouteStep* const step = next();
    return step ? Manoeuvres::icon(step->manoeuvre) : QString();
}

QString Navigator::turnText() const
{
    const RouteStep* const step = next();
    return step ? Manoeuvres::text(step->manoeuvre) : QString();
}

QString Navigator::turnStreet() const
{
    const RouteStep* const step = next();
    if (!step)
        return QString();
    return step->manoeuvre == Manoeuvre::Arrive ? m_destination : step->street;
}

double Navigator::metresToTurn() const
{
    const RouteStep* const step = next();
    return step ? step->at - m_driven : 0;
}

QString Navigator::turnDistance() const
{
    return next() ? Units::distance(metresToTurn()) : QString();
}

QString Navigator::remaining() const
{
    return isActive() ? Units::distance(m_route.length() - m_driven) : QString();
}

QString Navigator::remainingTime() const
{
    return isActive() ? Units::duration(m_route.secondsFrom(m_driven)) : QString();
}

QString Navigator::arrival() const
{
    const QTime now = QTime::fromString(GlobalSource::instance()->clockText(), clockFormat);
    if (!isActive() || !now.isValid())
        return QString();
    return now.addSecs(qRound(m_route.secondsFrom(m_driven))).toString(clockFormat);
}

void Navigator::setAvoidMotorways(bool avoid)
{
    if (avoid == m_avoidMotorways)
        return;
    m_avoidMotorways = avoid;
    Q_EMIT avoidMotorwaysChanged();
    const bool drives = isDriving();
    if (isActive() && navigateTo(m_place))
        setDriving(drives);
}

int Navigator::findPlace(const QString& words) const
{
    const QString wanted = words.trimmed();
    if (wanted.isEmpty())
        return -1;
    int found = -1;
    for (int i = 0; i < m_town->places.size(); ++i) {
        const QString& name = m_town->places.at(i).name;
        if (name.compare(wanted, Qt::CaseInsensitive) == 0)
            return i;
        if (found < 0 && name.startsWith(wanted, Qt::CaseInsensitive))
            found = i;
    }
    return found;
}

bool Navigator::navigateTo(int place)
{
    if (place < 0 || place >= m_town->places.size())
        return false;
    const Place& goal = m_town->places.at(place);
    const Route route = m_graph.route(m_position, goal.at, m_avoidMotorways);
    if (route.isEmpty())
        return false;
    m_place = place;
    m_destination = goal.name;
    follow(route);
    return true;
}

void Navigator::stop()
{
    if (!isActive())
        return;
    m_destination.clear();
    follow(Route());
}

void Navigator::follow(const Route& route)
{
    setDriving(false);
    m_route = route;
    m_driven = 0;
    m_nextStep = 0;
    m_steps.setSteps(route.steps);
    Q_EMIT routeChanged();
    if (isActive())
        moveTo(0);
    else
        Q_EMIT guidanceChanged();
}

void Navigator::setDriving(bool driving)
{
    const bool drives = driving && isActive();
    if (drives == isDriving())
        return;
    if (drives) {
        m_clock.start();
        m_timer.start();
    } else {
        m_timer.stop();
        m_destinations.setPosition(m_position);
    }
    Q_EMIT drivingChanged();
}

void Navigator::advance(double seconds)
{
    if (!isActive())
        return;
    const double speed = m_route.legs.at(m_route.legAt(m_driven)).speed;
    moveTo(std::min(m_route.length(), m_driven + speed * quickMotion * seconds));
    if (m_driven < m_route.length())
        return;
    stop();
    Q_EMIT arrived();
}

void Navigator::moveTo(double metres)
{
    m_driven = metres;
    m_position = m_route.pointAt(metres);
    m_heading = m_route.headingAt(metres);
    const int last = int(m_route.steps.size()) - 1;
    while (m_nextStep < last && m_route.steps.at(m_nextStep).at <= m_driven)
        ++m_nextStep;
    m_steps.moveTo(m_nextStep, m_driven);
    Q_EMIT moved();
    Q_EMIT guidanceChanged();
}
