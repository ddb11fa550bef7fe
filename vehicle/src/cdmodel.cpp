// SPDX-License-Identifier: MIT
#include "cdmodel.h"

#include <iterator>

namespace HmiVehicle {

namespace {

enum Status { NoDisc = 0, Loading = 1, Playing = 2, Paused = 3 };

constexpr int loadingTime = 2500;

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
        if (canPlay() && (status == Playing || status == Paused))
            setStatus(status);
    });
    on("nextTrack", [this] { seek(Step::Up); });
    on("previousTrack", [this] { seek(Step::Down); });
}

bool CdModel::canPlay() const
{
    return value("cdStatus").toInt() >= Playing;
}

void CdModel::activate(int)
{
    if (canPlay())
        setStatus(Playing);
}

void CdModel::deactivate()
{
    if (canPlay())
        setStatus(Paused);
}

void CdModel::seek(Step step)
{
    if (canPlay())
        showTrack(value("track").toInt() + int(step));
}

void CdModel::setStatus(int status)
{
    set("cdStatus", status);
    scheduler().cancel(&m_clock);
    if (status == Playing)
        m_clock = scheduler().every(1000, [this] { playOn(); });
}

void CdModel::showTrack(int track)
{
    const int number = (track - 1 + trackCount) % trackCount + 1;
    set("track", number);
    set("title", QString::fromUtf8(tracks[number - 1].title));
    set("duration", tracks[number - 1].duration);
    set("position", 0);
}

void CdModel::playOn()
{
    const int position = value("position").toInt() + 1;
    if (position >= value("duration").toInt())
        showTrack(value("track").toInt() + 1);
    else
        set("position", position);
}

void CdModel::eject()
{
    scheduler().cancel(&m_loading);
    setStatus(NoDisc);
    for (const char* const field : {"track", "trackCount", "position", "duration"})
        set(field, 0);
    set("title", QString());
    set("discTitle", QString());
}

void CdModel::insert()
{
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
