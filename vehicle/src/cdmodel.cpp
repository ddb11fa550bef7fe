// SPDX-License-Identifier: MIT
#include "cdmodel.h"

#include <iterator>
#include <utility>

namespace HmiVehicle {

namespace {

enum Status { NoDisc = 0, Loading = 1, Playing = 2, Paused = 3 };

constexpr int loadingTime = 2500;
constexpr int windStep = 5;          ///< seconds
constexpr int windTime = 250;        ///< milliseconds
constexpr int longestTime = 1000000; ///< seconds

struct Track
{
    const char* title;
    int duration;
};

const Track tracks[] = {{"Overture", 312},       {"The Ferry", 247},     {"Salt and Pine", 268}, {"Interlude", 94},
                        {"Harbour Lights", 301}, {"A Letter Home", 226}, {"Low Tide", 355}};
constexpr int trackCount = int(std::size(tracks));

} // namespace

CdModel::CdModel(Scheduler& scheduler)
    : AudioModel("CDSource", scheduler)
{
    set("trackCount", trackCount);
    set("discTitle", QStringLiteral("Coastal Suite"));
    setStatus(Paused);
    showTrack(1);
    on("togglePlayPause", [this](const QJsonArray& arguments) {
        const int status = arguments.at(0).toInt();
        if (hasDisc() && (status == Playing || status == Paused))
            setStatus(status);
    });
    on("nextTrack", [this] { seek(Step::Up); });
    on("previousTrack", [this] { seek(Step::Down); });
}

bool CdModel::canPlay(int) const
{
    return hasDisc();
}

bool CdModel::hasDisc() const
{
    return value("cdStatus").toInt() >= Playing;
}

void CdModel::activate(int)
{
    if (hasDisc())
        setStatus(Playing);
}

void CdModel::deactivate()
{
    stopWinding();
    if (hasDisc())
        setStatus(Paused);
}

void CdModel::seek(Step step)
{
    if (hasDisc())
        showTrack(value("track").toInt() + int(step));
}

void CdModel::setStatus(int status)
{
    set("cdStatus", status);
    scheduler().cancel(&m_clock);
    if (status == Playing)
        m_clock = scheduler().every(1000, [this] { move(1); });
}

void CdModel::showTrack(int track)
{
    const int number = (track - 1 + trackCount) % trackCount + 1;
    set("track", number);
    set("title", QString::fromUtf8(tracks[number - 1].title));
    set("duration", tracks[number - 1].duration);
    set("position", 0);
}

void CdModel::move(int seconds)
{
    const int position = value("position").toInt() + seconds;
    if (position >= value("duration").toInt())
        showTrack(value("track").toInt() + 1);
    else
        set("position", qMax(0, position));
}

void CdModel::startWinding(Step step)
{
    stopWinding();
    if (hasDisc())
        m_winding = scheduler().every(windTime, [this, step] { move(windStep * int(step)); });
}

void CdModel::stopWinding()
{
    scheduler().cancel(&m_winding);
}

void CdModel::interrupt()
{
    m_interrupted = value("cdStatus").toInt() == Playing;
    if (m_interrupted)
        setStatus(Paused);
}

void CdModel::goOn()
{
    if (std::exchange(m_interrupted, false) && value("cdStatus").toInt() == Paused)
        setStatus(Playing);
}

bool CdModel::assign(const QString& field, const QJsonValue& wanted)
{
    const int number = wanted.toInt();
    if (field == QLatin1String("cdStatus")) {
        if (number == NoDisc)
            eject();
        else if (number == Loading)
            insert();
        else if (hasDisc())
            setStatus(number);
        return number < Playing || hasDisc();
    }
    if (field == QLatin1String("track")) {
        if (hasDisc() && number >= 1 && number <= trackCount)
            showTrack(number);
        return value("track").toInt() == number;
    }
    const bool isTime = field == QLatin1String("position") || field == QLatin1String("duration");
    return (!isTime || number <= longestTime) && AudioModel::assign(field, wanted);
}

void CdModel::eject()
{
    scheduler().cancel(&m_loading);
    stopWinding();
    setStatus(NoDisc);
    for (const char* const field : {"track", "trackCount", "position", "duration"})
        set(field, 0);
    set("title", QString());
    set("discTitle", QString());
}

void CdModel::insert()
{
    scheduler().cancel(&m_loading);
    stopWinding();
    setStatus(Loading);
    m_loading = scheduler().answerAfter(loadingTime, [this] {
        m_loading = 0;
        set("trackCount", trackCount);
        set("discTitle", QStringLiteral("Coastal Suite"));
        showTrack(1);
        setStatus(Paused);
    });
}

} // namespace HmiVehicle
