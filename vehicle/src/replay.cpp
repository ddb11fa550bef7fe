// SPDX-License-Identifier: MIT
#include "replay.h"

#include "differences.h"
#include "peers.h"

#include <QJsonDocument>
#include <QLoggingCategory>

#include <utility>

namespace HmiVehicle {

namespace {

constexpr int patience = 2000;      ///< milliseconds for what the HMI had sent
constexpr int startTime = 60000;    ///< for the HMI to connect
constexpr int fencePatience = 1000; ///< for an HMI that may not answer any

QByteArray fenceLine(Channel channel, int number)
{
    const bool isPriority = channel == Channel::Priority;
    return eventLine(isPriority ? QStringLiteral("KeySource") : QStringLiteral("DeveloperSource"),
                     QStringLiteral("fence"), {number});
}

bool isFenceAnswer(const QByteArray& line, int number)
{
    const QJsonObject call = QJsonDocument::fromJson(line).object();
    return call.value(QLatin1String("call")).toString() == QLatin1String("fenceReached")
           && call.value(QLatin1String("args")).toArray().at(0).toInt() == number;
}

} // namespace

Replay::Replay(QObject* parent)
    : QObject(parent)
{
    m_delay.setSingleShot(true);
    m_patience.setSingleShot(true);
    connect(&m_delay, &QTimer::timeout, this, &Replay::step);
    connect(&m_patience, &QTimer::timeout, this, &Replay::giveUpWaiting);
}

Replay::~Replay() = default;

bool Replay::load(const QString& fileName)
{
    m_fileName = fileName;
    const bool loaded = m_recording.load(fileName);
    m_error = m_recording.errorString();
    return loaded;
}

void Replay::play(double speed)
{
    m_speed = speed;
    m_playing = true;
    step();
}

void Replay::addConnection(Channel channel, int socket)
{
    auto* const connection = new Connection(socket, hmiPeer(channel), this);
    connect(connection, &Connection::greetedByPeer, this, [this, channel, connection] {
        side(channel).arrived.append(connection);
        step();
    });
    connect(connection, &Connection::lineReceived, this,
            [this, channel](const QByteArray& line) { take(channel, line); });
    connect(connection, &Connection::closed, this, [this, channel, connection] {
        side(channel).arrived.removeOne(connection);
        if (side(channel).connection == connection)
            side(channel).connection = nullptr;
    });
    connection->start();
}

void Replay::take(Channel channel, const QByteArray& line)
{
    if (m_isFenced && isFenceAnswer(line, m_fence)) {
        m_isFenced = false;
        m_wantsFence = false;
        m_patience.stop();
    }
    const QByteArray content = Recording::comparable(line);
    if (!content.isEmpty())
        side(channel).actual.push_back(content);
    step();
}

void Replay::step()
{
    if (!m_playing || std::exchange(m_stepping, true))
        return;
    const auto& entries = m_recording.entries();
    while (m_next < entries.size() && playEntry(entries[m_next])) {
        m_lastTime = entries[m_next++].time;
        m_delayed = false;
        m_patience.stop();
    }
    m_stepping = false;
    if (m_playing && m_next == entries.size() && answersAreHere() && othersAreHandled(Channel::Touch))
        end(QString());
}

/// Whether it is done; otherwise something is waited for.
bool Replay::playEntry(const Recording::Entry& entry)
{
    if (entry.kind == Recording::FromHmi && !entry.line.isEmpty()) {
        side(entry.channel).expected.push_back(entry.line);
        side(entry.channel).numbers.push_back(entry.number);
    }
    if (entry.kind == Recording::Lost)
        m_error = QStringLiteral("%1:%2: lines were left out here, which will count as extra")
                      .arg(m_fileName)
                      .arg(entry.number);
    if (entry.kind != Recording::ToHmi && entry.kind != Recording::Greeting)
        return true;
    if (!delayIsOver(entry) || !answersAreHere() || !othersAreHandled(entry.channel) || !channelIsReady(entry))
        return false;
    if (entry.kind == Recording::Greeting)
        return true;
    if (side(entry.channel).connection)
        side(entry.channel).connection->send(entry.line + '\n');
    m_lastChannel = entry.channel;
    m_wantsFence = entry.channel != Channel::Touch;
    return true;
}

bool Replay::delayIsOver(const Recording::Entry& entry)
{
    if (!std::exchange(m_delayed, true) && m_speed > 0)
        m_delay.start(int(qMin((entry.time - m_lastTime) * 1000 / m_speed, 1e9)));
    return !m_delay.isActive();
}

bool Replay::answersAreHere()
{
    for (const Side& channel : m_sides) {
        if (channel.actual.size() >= channel.expected.size() || channel.waitedFor >= channel.expected.size())
            continue;
        if (!m_patience.isActive())
            m_patience.start(patience);
        return false;
    }
    return true;
}

/// Keys overtake state on their way, so what went over the other channel is handled first.
bool Replay::othersAreHandled(Channel channel)
{
    if (!m_wantsFence || !m_answersFences || channel == m_lastChannel || !side(m_lastChannel).connection)
        return true;
    if (!m_isFenced) {
        m_isFenced = true;
        side(m_lastChannel).connection->send(fenceLine(m_lastChannel, ++m_fence));
        m_patience.start(fencePatience);
    }
    return !m_isFenced;
}

bool Replay::channelIsReady(const Recording::Entry& entry)
{
    Side& channel = side(entry.channel);
    if (entry.kind == Recording::ToHmi)
        return true;
    if (channel.connection) { // it began anew then, so it does now
        std::exchange(channel.connection, nullptr)->hangUp();
        m_wantsFence = m_wantsFence && entry.channel != m_lastChannel;
    }
    if (channel.arrived.isEmpty()) {
        if (!m_patience.isActive())
            m_patience.start(startTime);
        return false;
    }
    channel.connection = channel.arrived.takeFirst();
    return true;
}

void Replay::giveUpWaiting()
{
    if (m_isFenced) {
        m_isFenced = false;
        m_wantsFence = false;
        m_answersFences = false;
        return step();
    }
    if (!answersAreHere()) {
        m_patience.stop();
        for (Side& channel : m_sides)
            channel.waitedFor = channel.expected.size();
        return step();
    }
    end(QStringLiteral("no HMI connects to ") + channelName(m_recording.entries()[m_next].channel));
}

void Replay::end(const QString& problem)
{
    m_playing = false;
    m_patience.stop();
    m_delay.stop();
    Q_EMIT finished(problem);
}

QStringList Replay::differences() const
{
    QStringList texts;
    for (const Channel channel : allChannels) {
        const Side& compared = m_sides[size_t(channel)];
        for (const Difference& difference : differencesOf(compared.expected, compared.actual)) {
            const bool isExpected = difference.expected >= 0;
            const QString expected =
                isExpected ? Recording::describe(compared.expected[size_t(difference.expected)]) : QString();
            const QString actual =
                difference.actual >= 0 ? Recording::describe(compared.actual[size_t(difference.actual)]) : QString();
            const QString where =
                isExpected ? QStringLiteral("%1:%2").arg(m_fileName).arg(compared.numbers[size_t(difference.expected)])
                           : m_fileName;
            const QString what = !isExpected        ? QStringLiteral("extra: ") + actual
                                 : actual.isEmpty() ? QStringLiteral("missing: ") + expected
                                                    : QStringLiteral("expected %1, came %2").arg(expected, actual);
            texts.append(QStringLiteral("%1: %2: %3").arg(where, channelName(channel), what));
        }
    }
    return texts;
}

} // namespace HmiVehicle
