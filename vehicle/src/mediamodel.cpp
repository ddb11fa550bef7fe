// SPDX-License-Identifier: MIT
#include "mediamodel.h"

#include <iterator>
#include <utility>

namespace HmiVehicle {

namespace {

constexpr int restartLimit = 3;      ///< seconds; later "previous" goes to the start of the track
constexpr int windStep = 5;          ///< seconds
constexpr int windTime = 250;        ///< milliseconds
constexpr int longestTime = 1000000; ///< seconds
constexpr int longestText = 256;

struct Track
{
    const char* title;
    const char* artist;
    const char* album;
    int duration;
};

// All music is invented.
const Track tracks[] = {
    {"Neon Rain", "The Paper Lanterns", "Streetlight Season", 214},
    {"Corner Shop Serenade", "The Paper Lanterns", "Streetlight Season", 187},
    {"Last Tram", "The Paper Lanterns", "Streetlight Season", 251},
    {"Slow Water", "Harold Finch Quintet", "Blue Staircase", 342},
    {"Late Tram Home", "Harold Finch Quintet", "Blue Staircase", 298},
    {"Mile Marker", "The Dusty Maps", "Two-Lane Summer", 203},
    {"Porch Light", "The Dusty Maps", "Two-Lane Summer", 176},
    {"Turn It Over", "Iron Orchard", "Harvest of Sparks", 229},
    {"Rust and Honey", "Iron Orchard", "Harvest of Sparks", 265},
    {"Night Drive", "Kite Engine", "Signals", 318},
    {"Zwischen den Zügen", "Anna Lindner", "Gleis 9", 233},
    {"Fünf Minuten noch", "Anna Lindner", "Gleis 9", 195},
    {"Le phare", "Colline", "Marée haute", 241},
    {"Bis ans Meer", "Colline feat. Anna Lindner", "Marée haute", 222},
    {"Cartas", "Radio Estrella Ensemble", "Sin fronteras", 209},
    {"夜の港", "Minato", "潮", 260},
};
constexpr int trackCount = int(std::size(tracks));

QJsonArray library()
{
    QJsonArray list;
    for (const Track& track : tracks)
        list.append(QJsonObject{{QStringLiteral("title"), QString::fromUtf8(track.title)},
                                {QStringLiteral("artist"), QString::fromUtf8(track.artist)},
                                {QStringLiteral("album"), QString::fromUtf8(track.album)},
                                {QStringLiteral("duration"), track.duration}});
    return list;
}

} // namespace

MediaModel::MediaModel(Scheduler& scheduler)
    : AudioModel("MediaAudioSource", scheduler)
{
    set("library", library());
    set("playing", false);
    showTrack(0);
    on("togglePlayPause", [this] { setPlaying(!value("playing").toBool()); });
    on("next", [this] { next(); });
    on("previous", [this] { previous(); });
    on("playTrack", [this](const QJsonArray& arguments) {
        const int index = arguments.at(0).toInt();
        if (m_remote || index < 0 || index >= trackCount)
            return;
        showTrack(index);
        setPlaying(true);
    });
    on("seekTo", [this](const QJsonArray& arguments) { seekTo(arguments.at(0).toInt()); });
}

void MediaModel::setRemote(MediaRemote* remote)
{
    const bool wasPlaying = value("playing").toBool();
    setPlaying(false);
    stopWinding();
    m_interrupted = false;
    m_remote = remote;
    set("library", remote ? QJsonArray() : library());
    if (remote) {
        set("trackIndex", -1);
        show(MediaShown());
        return;
    }
    showTrack(0);
    setPlaying(wasPlaying);
}

void MediaModel::show(const MediaShown& shown)
{
    if (!m_remote)
        return;
    set("playing", shown.playing);
    set("title", shown.title.left(longestText));
    set("artist", shown.artist.left(longestText));
    set("album", shown.album.left(longestText));
    set("duration", qBound(0, shown.duration, longestTime));
    set("position", qBound(0, shown.position, longestTime));
}

void MediaModel::next()
{
    if (m_remote)
        m_remote->next();
    else
        showTrack(value("trackIndex").toInt() + 1);
}

void MediaModel::seekTo(int position)
{
    const int bounded = qBound(0, position, value("duration").toInt());
    if (m_remote)
        m_remote->seekTo(bounded);
    else
        set("position", bounded);
}

void MediaModel::activate(int)
{
    setPlaying(true);
}

void MediaModel::deactivate()
{
    stopWinding();
    setPlaying(false);
}

void MediaModel::interrupt()
{
    m_interrupted = value("playing").toBool();
    if (m_interrupted)
        setPlaying(false);
}

void MediaModel::goOn()
{
    if (std::exchange(m_interrupted, false))
        setPlaying(true);
}

bool MediaModel::assign(const QString& field, const QJsonValue& wanted)
{
    const int number = wanted.toInt();
    if (field == QLatin1String("playing")) {
        setPlaying(wanted.toBool());
    } else if (field == QLatin1String("trackIndex")) {
        if (m_remote || number < 0 || number >= trackCount)
            return false;
        showTrack(number);
    } else {
        const bool isTime = field == QLatin1String("position") || field == QLatin1String("duration");
        return (!isTime || number <= longestTime) && AudioModel::assign(field, wanted);
    }
    return true;
}

void MediaModel::seek(Step step)
{
    if (step == Step::Up)
        next();
    else
        previous();
}

void MediaModel::startWinding(Step step)
{
    stopWinding();
    m_winding = scheduler().every(windTime, [this, step] { move(windStep * int(step)); });
}

void MediaModel::stopWinding()
{
    scheduler().cancel(&m_winding);
}

void MediaModel::setPlaying(bool playing)
{
    if (m_remote) {
        if (playing != value("playing").toBool())
            m_remote->setPlaying(playing);
        return; // it tells when it does
    }
    set("playing", playing);
    scheduler().cancel(&m_clock);
    if (playing)
        m_clock = scheduler().every(1000, [this] { move(1); });
}

void MediaModel::showTrack(int index)
{
    const int row = (index + trackCount) % trackCount;
    const Track& track = tracks[row];
    set("trackIndex", row);
    set("title", QString::fromUtf8(track.title));
    set("artist", QString::fromUtf8(track.artist));
    set("album", QString::fromUtf8(track.album));
    set("duration", track.duration);
    set("position", 0);
}

void MediaModel::move(int seconds)
{
    const int position = value("position").toInt() + seconds;
    if (m_remote)
        return seekTo(position);
    if (position >= value("duration").toInt())
        return showTrack(value("trackIndex").toInt() + 1);
    set("position", qMax(0, position));
}

void MediaModel::previous()
{
    if (m_remote)
        return m_remote->previous();
    if (value("position").toInt() > restartLimit)
        set("position", 0);
    else
        showTrack(value("trackIndex").toInt() - 1);
}

} // namespace HmiVehicle
