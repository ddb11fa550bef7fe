// SPDX-License-Identifier: MIT
#include "controlsession.h"

#include "HmiVehicle/vehicleservice.h"
#include "actions.h"
#include "calllog.h"
#include "calltable.h"
#include "connection.h"
#include "fence.h"

#include <QJsonDocument>
#include <QPointer>

namespace HmiVehicle {

namespace {

constexpr int usualTimeout = 5000;
constexpr int usualQuietTime = 500;
constexpr int longestTimeout = 3600 * 1000;
constexpr int maximumRequests = 1000; ///< that wait for their turn
constexpr int beyondLongPress = 200;  ///< milliseconds that a held key is held longer than it has to be
constexpr int listedCalls = 10;       ///< in a complaint

QString listed(const QStringList& calls)
{
    if (calls.isEmpty())
        return QStringLiteral("nothing");
    QString text = calls.mid(0, listedCalls).join(QStringLiteral(", "));
    if (calls.size() > listedCalls)
        text += QStringLiteral(" and %1 more").arg(calls.size() - listedCalls);
    return text;
}

} // namespace

ControlSession::ControlSession(Connection* connection, VehicleService& service, CallLog& calls, QObject* parent)
    : QObject(parent)
    , m_connection(connection)
    , m_service(service)
    , m_calls(calls)
    , m_owner(KeyInput::newOwner())
{
    connection->setParent(this);
    connect(connection, &Connection::lineReceived, this, &ControlSession::take);
    connect(connection, &Connection::closed, this, [this] {
        endWait();
        m_requests.clear();
        m_service.vehicle().keys().releaseAll(m_owner);
        deleteLater();
    });
    connection->start();
}

ControlSession::~ControlSession()
{
    m_service.vehicle().keys().releaseAll(m_owner);
}

void ControlSession::take(const QByteArray& line)
{
    const QJsonObject object = QJsonDocument::fromJson(line).object();
    const QJsonArray list = object.value(QLatin1String("command")).toArray();
    const QJsonValue id = object.value(QLatin1String("id"));
    QStringList words;
    bool allTexts = !list.isEmpty() && id.isDouble();
    for (const auto& word : list) {
        allTexts = allTexts && word.isString();
        words.append(word.toString());
    }
    if (!allTexts)
        return m_connection->hangUp(QStringLiteral("it sends no commands"));
    if (m_requests.size() >= maximumRequests)
        return m_connection->hangUp(QStringLiteral("it does not wait for answers"));
    Request request{id,
                    {},
                    qBound(0, object.value(QLatin1String("timeout")).toInt(usualTimeout), longestTimeout),
                    object.contains(QLatin1String("timeout"))};
    const QString problem = Command::parse(words, &request.command);
    if (!problem.isEmpty())
        return answer(id, problem, QJsonValue(QJsonValue::Undefined));
    m_requests.enqueue(request);
    if (!m_busy)
        runNext();
}

void ControlSession::runNext()
{
    while (!m_busy && !m_requests.isEmpty()) {
        m_busy = true;
        run(m_requests.head());
    }
}

void ControlSession::run(const Request& request)
{
    if (request.command.verb == Command::Expect)
        return expect(request);
    if (request.command.verb == Command::LongKey)
        return holdKey(request.command);
    QJsonValue result(QJsonValue::Undefined);
    const QString problem = runNow(request.command, &result);
    const bool changesState = request.command.verb == Command::Set || request.command.verb == Command::Do
                              || request.command.verb == Command::Advance;
    if (!problem.isEmpty())
        fail(problem);
    else if (changesState)
        succeedWhenSeen();
    else
        succeed(result);
}

/// Keys overtake state on their way: a key that comes next is to find the HMI as the state made it.
void ControlSession::succeedWhenSeen()
{
    endWait();
    m_wait = new QObject(this);
    auto* const fence = new Fence(m_service, usualQuietTime, m_wait);
    connect(fence, &Fence::passed, this, [this] { succeed(); });
}

QString ControlSession::runNow(const Command& command, QJsonValue* result)
{
    Vehicle& vehicle = m_service.vehicle();
    const auto accepted = [](bool done) {
        return done ? QString() : QStringLiteral("the key is down, or somebody else holds it");
    };
    switch (command.verb) {
    case Command::ShortKey:
        return accepted(vehicle.keys().press(command.key, m_owner) && vehicle.keys().release(command.key, m_owner));
    case Command::Press:
        return accepted(vehicle.keys().press(command.key, m_owner));
    case Command::Release:
        return accepted(vehicle.keys().release(command.key, m_owner));
    case Command::Turn:
        return vehicle.keys().turn(command.key, command.number, m_owner)
                   ? QString()
                   : QStringLiteral("the key cannot be turned so");
    case Command::RawKey:
        vehicle.keyEvent(command.key, command.number);
        break;
    case Command::Combination:
        vehicle.keyComboEvent(command.key, command.number);
        break;
    case Command::Set:
        if (!vehicle.setState(command.source, command.name, command.value))
            return QStringLiteral("%1.%2 cannot be set so").arg(command.source, command.name);
        break;
    case Command::Get:
        *result = vehicle.state(command.source).value(command.name);
        break;
    case Command::Do:
        findAction(command.name)->happen(vehicle, command.details);
        break;
    case Command::Advance:
        vehicle.advance(command.number);
        break;
    case Command::Forget:
        m_calls.forget();
        break;
    case Command::LongKey:
    case Command::Expect:
        break;
    }
    return QString();
}

void ControlSession::holdKey(const Command& command)
{
    KeyInput& keys = m_service.vehicle().keys();
    const int time = command.number ? command.number : keys.longPressTime(command.key) + beyondLongPress;
    if (!keys.press(command.key, m_owner))
        return fail(QStringLiteral("the key is down, or somebody else holds it"));
    const QPointer<ControlSession> self(this);
    m_service.vehicle().after(time, [self, key = command.key] {
        if (!self || self->m_requests.isEmpty())
            return;
        self->m_service.vehicle().keys().release(key, self->m_owner);
        self->succeed();
    });
    if (!m_service.timePasses())
        m_service.vehicle().advance(time);
}

void ControlSession::expect(const Request& request)
{
    m_wait = new QObject(this);
    switch (request.command.expectation.kind) {
    case Expectation::Call:
        return expectCall(request);
    case Expectation::State:
        return expectState(request);
    case Expectation::Nothing:
        return expectNothing(request);
    case Expectation::Hmi:
        return expectHmi(request);
    }
}

void ControlSession::wait(int timeout, std::function<QString()> complaint)
{
    auto* const deadline = new QTimer(m_wait);
    deadline->setSingleShot(true);
    connect(deadline, &QTimer::timeout, this, [this, complaint = std::move(complaint)] { fail(complaint()); });
    deadline->start(timeout);
}

void ControlSession::expectCall(const Request& request)
{
    const Expectation expectation = request.command.expectation;
    if (m_calls.take(expectation))
        return succeed();
    connect(&m_calls, &CallLog::grown, m_wait, [this, expectation] {
        if (m_calls.take(expectation))
            succeed();
    });
    wait(request.timeout, [this, expectation] {
        return QStringLiteral("expected %1, came %2").arg(expectation.text, listed(m_calls.sinceTaken()));
    });
}

void ControlSession::expectState(const Request& request)
{
    const Expectation expectation = request.command.expectation;
    const auto actual = [this, expectation] {
        return m_service.vehicle().state(expectation.source).value(expectation.name);
    };
    if (expectation.holdsFor(actual()))
        return succeedWhenSeen();
    connect(&m_service, &VehicleService::stateChanged, m_wait, [this, expectation, actual] {
        if (expectation.holdsFor(actual()))
            succeedWhenSeen();
    });
    wait(request.timeout, [expectation, actual] {
        return QStringLiteral("expected %1, it is %2").arg(expectation.text, wordFromValue(actual()));
    });
}

void ControlSession::expectNothing(const Request& request)
{
    const int quietTime = request.hasTimeout ? request.timeout : usualQuietTime;
    auto* const fence = new Fence(m_service, quietTime, m_wait);
    connect(fence, &Fence::passed, this, [this] {
        const QStringList calls = m_calls.leftOver();
        m_calls.forget();
        calls.isEmpty() ? succeed() : fail(QStringLiteral("expected no further call, came ") + listed(calls));
    });
}

void ControlSession::expectHmi(const Request& request)
{
    const auto tryIt = [this, timeout = request.timeout] {
        if (m_service.hmiCount(Channel::Messages) == 0 || m_service.hmiCount(Channel::Priority) == 0)
            return;
        disconnect(&m_service, &VehicleService::hmisChanged, m_wait, nullptr);
        auto* const fence = new Fence(m_service, timeout, m_wait);
        connect(fence, &Fence::passed, this, [this](bool answered) {
            if (answered)
                succeed();
        });
    };
    connect(&m_service, &VehicleService::hmisChanged, m_wait, tryIt);
    wait(request.timeout, [this] {
        return m_service.hmiCount(Channel::Messages)
                   ? QStringLiteral("expected an HMI, one is there but answers nothing")
                   : QStringLiteral("expected an HMI, none is connected");
    });
    tryIt();
}

void ControlSession::succeed(const QJsonValue& result)
{
    answer(m_requests.head().id, QString(), result);
    finish();
}

void ControlSession::fail(const QString& problem)
{
    answer(m_requests.head().id, problem, QJsonValue(QJsonValue::Undefined));
    finish();
}

void ControlSession::finish()
{
    endWait();
    if (m_requests.isEmpty())
        return; // the client left while it was answered
    m_requests.dequeue();
    m_busy = false;
    QMetaObject::invokeMethod(this, &ControlSession::runNext, Qt::QueuedConnection);
}

/// It may be one of these objects that speaks right now, so they go later; but they say nothing any more.
void ControlSession::endWait()
{
    if (!m_wait)
        return;
    const QObjectList waiting = m_wait->children();
    for (QObject* const object : waiting)
        object->disconnect(this);
    m_calls.disconnect(m_wait);
    m_service.disconnect(m_wait);
    m_wait->deleteLater();
    m_wait = nullptr;
}

void ControlSession::answer(const QJsonValue& id, const QString& problem, const QJsonValue& result)
{
    QJsonObject line{{QStringLiteral("id"), id}};
    if (!problem.isEmpty())
        line.insert(QStringLiteral("error"), problem);
    else
        line.insert(QStringLiteral("value"), result.isUndefined() ? QJsonValue() : result);
    m_connection->send(QJsonDocument(line).toJson(QJsonDocument::Compact) + '\n');
}

} // namespace HmiVehicle
