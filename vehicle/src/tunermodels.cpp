// SPDX-License-Identifier: MIT
#include "tunermodels.h"

#include <QStringList>

namespace HmiVehicle {

namespace {

constexpr int windTime = 500;
constexpr int replayTitles = 8; ///< how many titles back the buffer reaches

const char* const categories[] = {"Hits", "Jazz", "Country", "Rock", "Dance", "Classical", "Comedy", "News"};

} // namespace

FmTunerModel::FmTunerModel(Scheduler& scheduler)
    : TunerModel(fmBand(), scheduler)
{
    set("hdSignalLossStatus", 0);
    FmTunerModel::tuned(&fmBand().stations.front());
}

void FmTunerModel::tuned(const Station* station)
{
    TunerModel::tuned(station);
    set("stereo", station && station->signal >= 60);
    set("hdSignalLossStatus", 0); // tuning once more finds the digital signal again
}

DabTunerModel::DabTunerModel(Scheduler& scheduler)
    : TunerModel(dabBand(), scheduler)
{
    DabTunerModel::tuned(&dabBand().stations.front());
}

void DabTunerModel::tuned(const Station* station)
{
    TunerModel::tuned(station);
    const QString block = value("frequency").toString().section(QLatin1Char(' '), 0, 0);
    set("ensemble", QStringLiteral("Multiplex %1").arg(block));
}

XmTunerModel::XmTunerModel(Scheduler& scheduler)
    : TunerModel(xmBand(), scheduler)
{
    set("replayStatus", 0);
    set("playStatus", 1);
    XmTunerModel::tuned(&xmBand().stations.front());
    on("seekForwardShort", [this] { showTitle(m_titlesBack - 1); });
    on("seekReverseShort", [this] { showTitle(m_titlesBack + 1); });
    on("seekForwardLong", [this](const QJsonArray& arguments) { wind(-1, arguments.at(0).toInt() == 1); });
    on("seekReverseLong", [this](const QJsonArray& arguments) { wind(1, arguments.at(0).toInt() == 1); });
    on("togglePlayPause", [this](const QJsonArray& arguments) {
        const bool plays = arguments.at(0).toInt() == 1;
        set("playStatus", plays ? 1 : 0);
        if (!plays)
            set("replayStatus", 1); // what comes meanwhile is kept and heard later
    });
    on("startReplay", [this] { showTitle(1); });
    on("goLive", [this] { showTitle(0); });
}

void XmTunerModel::tuned(const Station* station)
{
    TunerModel::tuned(station);
    for (size_t i = 0; i < xmBand().stations.size(); ++i)
        if (station == &xmBand().stations[i])
            set("category", QString::fromLatin1(categories[i]));
    set("channelNumber", value("frequency").toString().toInt());
    set("playStatus", 1);
    showTitle(0);
}

/// \a titlesBack 0 is what is on the air now.
void XmTunerModel::showTitle(int titlesBack)
{
    m_titlesBack = qBound(0, titlesBack, replayTitles);
    const QStringList parts = value("radioText").toString().split(QStringLiteral(" - "));
    const QString title = parts.last();
    set("replayStatus", m_titlesBack > 0 ? 1 : 0);
    set("artist", parts.size() > 1 ? parts.first() : value("stationName").toString());
    set("title", m_titlesBack ? QStringLiteral("%1 (%2 earlier)").arg(title).arg(m_titlesBack) : title);
}

void XmTunerModel::wind(int direction, bool start)
{
    scheduler().cancel(&m_wind);
    if (start)
        m_wind = scheduler().every(windTime, [this, direction] { showTitle(m_titlesBack + direction); });
}

} // namespace HmiVehicle
