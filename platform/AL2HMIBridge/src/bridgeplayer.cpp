// SPDX-License-Identifier: MIT
#include "bridgeplayer.h"

#include "channelreader.h"
#include "bridgelimits.h"

#include <QBasicTimer>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QPointer>

#include <cmath>
#include <map>
#include <utility>

namespace AL2HMIBridge {

namespace {

const QLatin1String timeKey("t");
const QLatin1String channelKey("channel");
const QLatin1String directionKey("direction");
const QLatin1String lineKey("line");
const QLatin1String textKey("text");
const QLatin1String droppedKey("dropped");

struct RecordedLine
{
    double time = 0;
    BridgeEndpoint::Channel channel = BridgeEndpoint::Messages;
    QByteArray line;
    bool greets = false;
};

bool channelFromName(const QString& name, BridgeEndpoint::Channel* channel)
{
    for (const auto known : {BridgeEndpoint::Messages, BridgeEndpoint::Priority, BridgeEndpoint::Touch}) {
        if (BridgeEndpoint::channelName(known) != name)
            continue;
        *channel = known;
        return true;
    }
    return false;
}

/// Empty, or what is wrong with the line. \a plays tells whether it is one to be played.
QString parseRecorded(const QByteArray& text, double earliest, RecordedLine* recorded, bool* plays)
{
    QJsonParseError error;
    const QJsonObject object = QJsonDocument::fromJson(text, &error).object();
    if (error.error != QJsonParseError::NoError)
        return QStringLiteral("not JSON: %1").arg(error.errorString());
    const QJsonValue time = object.value(timeKey);
    if (!time.isDouble() || !std::isfinite(time.toDouble()) || time.toDouble() < earliest)
        return QStringLiteral("\"t\" must be a time not before the line above");
    if (!channelFromName(object.value(channelKey).toString(), &recorded->channel))
        return QStringLiteral("\"channel\" must be messages, priority or touch");
    const QString direction = object.value(directionKey).toString();
    if (direction != QLatin1String("in") && direction != QLatin1String("out"))
        return QStringLiteral("\"direction\" must be in or out");
    const QJsonValue line = object.value(lineKey);
    const bool isText = object.value(textKey).isString();
    const bool isGap = object.value(droppedKey).isDouble();
    if (line.isObject() + isText + isGap != 1)
        return QStringLiteral("one of \"line\", \"text\" and \"dropped\" must be there");
    recorded->time = time.toDouble();
    recorded->line = isText ? object.value(textKey).toString().toUtf8()
                            : QJsonDocument(line.toObject()).toJson(QJsonDocument::Compact);
    recorded->greets = line.toObject().contains(QLatin1String("protocol"));
    *plays = direction == QLatin1String("in") && !isGap;
    return QString();
}

} // namespace

struct Playback
{
    std::vector<RecordedLine> lines;
    size_t next = 0;
    double speed = 1;
    QElapsedTimer clock;
    QBasicTimer timer;
    std::map<BridgeEndpoint::Channel, std::unique_ptr<ChannelReader>> readers;

    /// A recording may begin in the middle of a connection.
    ChannelReader& readerFor(const RecordedLine& line)
    {
        std::unique_ptr<ChannelReader>& reader = readers[line.channel];
        if (!reader || line.greets)
            reader = std::make_unique<ChannelReader>(line.channel);
        if (!line.greets && !reader->greeted())
            reader->assumeGreeted();
        return *reader;
    }

    qint64 dueIn(const RecordedLine& line) const
    {
        return speed > 0 ? qint64((line.time - lines.front().time) * 1000 / speed) - clock.elapsed() : 0;
    }

    void hangUp()
    {
        for (const auto& reader : readers) {
            Message message;
            message.kind = Message::Disconnected;
            message.channel = reader.first;
            deliver(message);
        }
        readers.clear();
    }
};

BridgePlayer::BridgePlayer(QObject* parent)
    : QObject(parent)
    , m_playback(std::make_unique<Playback>())
{
}

BridgePlayer::~BridgePlayer() = default;

bool BridgePlayer::load(const QString& fileName)
{
    stop();
    m_playback->lines.clear();
    QFile file(fileName);
    const QFileInfo info(fileName);
    const auto fail = [&](const QString& problem) {
        m_playback->lines.clear();
        m_error = fileName + QStringLiteral(": ") + problem;
        return false;
    };
    if (!info.isFile())
        return fail(QStringLiteral("not a regular file"));
    if (info.size() > maximumRecording)
        return fail(QStringLiteral("larger than %1 bytes").arg(maximumRecording));
    if (!file.open(QIODevice::ReadOnly))
        return fail(file.errorString());
    double time = 0;
    for (int number = 1; !file.atEnd(); ++number) {
        RecordedLine recorded;
        bool plays = false;
        const QString problem = parseRecorded(file.readLine(), time, &recorded, &plays);
        if (!problem.isEmpty()) {
            m_playback->lines.clear();
            m_error = QStringLiteral("%1:%2: %3").arg(fileName).arg(number).arg(problem);
            return false;
        }
        time = recorded.time;
        if (plays)
            m_playback->lines.push_back(std::move(recorded));
    }
    m_error.clear();
    return true;
}

bool BridgePlayer::play(double speed)
{
    stop();
    if (m_playback->lines.empty() || speed < 0 || !std::isfinite(speed))
        return false;
    m_playback->next = 0;
    m_playback->speed = speed;
    m_playback->clock.start();
    m_playback->timer.start(0, this);
    return true;
}

void BridgePlayer::stop()
{
    m_playback->timer.stop();
    m_playback->hangUp();
}

void BridgePlayer::timerEvent(QTimerEvent*)
{
    playDueLines();
}

void BridgePlayer::playDueLines()
{
    Playback& playback = *m_playback;
    const QPointer<BridgePlayer> self(this);
    QElapsedTimer spent;
    spent.start();
    while (playback.next < playback.lines.size()) {
        const RecordedLine& line = playback.lines[playback.next];
        const qint64 wait = playback.dueIn(line);
        if (wait > 0 || spent.elapsed() >= guiSlice)
            return playback.timer.start(int(qMax<qint64>(wait, 0)), Qt::PreciseTimer, this);
        ++playback.next;
        std::vector<Message> messages;
        playback.readerFor(line).feedLine(line.line, &messages);
        for (Message& message : messages)
            deliver(message);
        if (!self || !playback.timer.isActive())
            return; // a listener stopped or destroyed the player
    }
    stop();
    Q_EMIT finished();
}

} // namespace AL2HMIBridge
