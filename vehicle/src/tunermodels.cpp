// SPDX-License-Identifier: MIT
#include "tunermodels.h"

#include <QStringList>

#include <iterator>
#include <utility>

namespace HmiVehicle {

namespace {

constexpr int searchTime = 1500; ///< milliseconds until a digital signal is found
constexpr int weakTime = 8000;   ///< that a weak one stays, and stays away
constexpr int weakSignal = 65;   ///< per cent
constexpr int mostPrograms = 8;

constexpr int windTime = 250;       ///< milliseconds
constexpr int windStep = 5;         ///< seconds
constexpr int titleLength = 200;    ///< seconds
constexpr int longestReplay = 1800; ///< seconds
constexpr int kept = 1200;          ///< seconds that are there of every channel at once
constexpr int lengthStep = 10;      ///< seconds between reports of the buffer's length
constexpr int restartLimit = 3;     ///< seconds; later a step back goes to the beginning of the title

const char* const categories[] = {"Hits", "Jazz", "Country", "Rock", "Dance", "Classical", "Comedy", "News"};

struct Title
{
    const char* artist;
    const char* title;
};

// All of it is invented.
const Title earlierTitles[] = {{"Colline", "Le phare"},
                               {"Kite Engine", "Signals"},
                               {"The Paper Lanterns", "Last Tram"},
                               {"Anna Lindner", "Gleis 9"},
                               {"Harold Finch Quintet", "Blue Staircase"},
                               {"The Dusty Maps", "Porch Light"},
                               {"Iron Orchard", "Rust and Honey"},
                               {"Mira Vale", "Paper Moon Motel"}};
constexpr int titleCount = int(std::size(earlierTitles));
/// When a channel's own title began, seconds on the time scale of onAir().
constexpr int ownTitle = titleCount * titleLength;

} // namespace

FmTunerModel::FmTunerModel(Scheduler& scheduler)
    : TunerModel(fmBand(), scheduler)
{
    set("hdSignalLossStatus", 0);
    FmTunerModel::tuned(&fmBand().stations.front());
    scheduler.cancel(&m_digital);
    acquireDigital(); // it has been playing for a while
}

/// "-1" asks for the analogue programme, a number for a digital one, anything else for what is best.
void FmTunerModel::tuneToProgram(const QString& frequency, const QString& subChannel)
{
    bool isNumber = false;
    const int program = subChannel.toInt(&isNumber);
    m_wantedProgram = !isNumber ? 1 : qBound(0, program, mostPrograms);
    tuneTo(frequency);
    m_wantedProgram = 1; // of the next station, also when this one is not in the band
}

void FmTunerModel::tuned(const Station* station)
{
    TunerModel::tuned(station);
    const int programs = station ? station->programs : 0;
    m_isWeak = station && station->signal < weakSignal;
    set("stereo", station && station->signal >= 60);
    set("hdAvailable", programs > 0);
    set("hdProgram", 0);
    set("hdSignalLossStatus", 0);
    scheduler().cancel(&m_digital);
    const int program = qMin(std::exchange(m_wantedProgram, 1), programs);
    if (program > 0)
        lookForDigital(program);
}

void FmTunerModel::lookForDigital(int program)
{
    m_digital = scheduler().answerAfter(searchTime, [this, program] {
        m_digital = 0;
        acquireDigital();
        set("hdProgram", program);
    });
}

void FmTunerModel::acquireDigital()
{
    if (!value("hdAvailable").toBool())
        return;
    scheduler().cancel(&m_digital);
    set("hdSignalLossStatus", 0);
    set("hdProgram", 1);
    if (m_isWeak)
        m_digital = scheduler().every(weakTime, [this] { loseDigital(); });
}

void FmTunerModel::loseDigital()
{
    if (value("hdProgram").toInt() == 0)
        return;
    scheduler().cancel(&m_digital);
    set("hdProgram", 0);
    set("hdSignalLossStatus", 1);
    if (m_isWeak)
        m_digital = scheduler().every(weakTime, [this] { acquireDigital(); });
}

bool FmTunerModel::assign(const QString& field, const QJsonValue& wanted)
{
    if (field != QLatin1String("hdSignalLossStatus"))
        return TunerModel::assign(field, wanted);
    scheduler().cancel(&m_digital);
    wanted.toInt() ? loseDigital() : acquireDigital();
    return TunerModel::assign(field, wanted); // also when the station sends nothing digital
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
    set("replayOffset", 0);
    set("replayLength", 0);
    XmTunerModel::tuned(&xmBand().stations.front());
    addReplayAnswers();
    scheduler.every(1000, [this] { passSecond(); });
}

void XmTunerModel::addReplayAnswers()
{
    on("seekForwardShort", [this] { stepTitle(Step::Up); });
    on("seekReverseShort", [this] { stepTitle(Step::Down); });
    on("seekForwardLong", [this](const QJsonArray& arguments) { wind(Step::Up, arguments.at(0).toInt() == 1); });
    on("seekReverseLong", [this](const QJsonArray& arguments) { wind(Step::Down, arguments.at(0).toInt() == 1); });
    on("togglePlayPause", [this](const QJsonArray& arguments) { setPlaying(arguments.at(0).toInt() == 1); });
    on("startReplay",
       [this] { setOffset(onAir() % titleLength + (onAir() % titleLength < restartLimit ? titleLength : 0)); });
    on("goLive", [this] {
        setPlaying(true);
        setOffset(0);
    });
}

int XmTunerModel::onAir() const
{
    return ownTitle + titleLength / 2 + int(scheduler().now() / 1000);
}

void XmTunerModel::tuned(const Station* station)
{
    TunerModel::tuned(station);
    for (size_t i = 0; i < xmBand().stations.size(); ++i) {
        if (station != &xmBand().stations[i])
            continue;
        set("category", QString::fromLatin1(categories[i]));
        m_channel = int(i);
    }
    set("channelNumber", value("frequency").toString().toInt());
    m_tuned = onAir();
    set("replayLength", kept);
    scheduler().cancel(&m_wind);
    set("playStatus", 1);
    setOffset(0);
}

void XmTunerModel::stopWinding()
{
    TunerModel::stopWinding();
    scheduler().cancel(&m_wind);
}

void XmTunerModel::wind(Step step, bool start)
{
    scheduler().cancel(&m_wind);
    if (start)
        m_wind = scheduler().every(windTime,
                                   [this, step] { setOffset(value("replayOffset").toInt() - windStep * int(step)); });
}

void XmTunerModel::stepTitle(Step step)
{
    const int into = heard() % titleLength;
    const int offset = value("replayOffset").toInt();
    if (step == Step::Up)
        setOffset(offset - (titleLength - into));
    else
        setOffset(offset + (into > restartLimit ? into : into + titleLength));
}

void XmTunerModel::setOffset(int seconds)
{
    const int offset = qBound(0, seconds, value("replayLength").toInt());
    set("replayOffset", offset);
    set("replayStatus", offset > 0 || value("playStatus").toInt() == 0 ? 1 : 0);
    showTitle();
}

/// What comes while it pauses is kept and heard later.
void XmTunerModel::setPlaying(bool playing)
{
    set("playStatus", playing ? 1 : 0);
    setOffset(value("replayOffset").toInt());
}

void XmTunerModel::passSecond()
{
    const int length = qMin(longestReplay, kept + (onAir() - m_tuned) / lengthStep * lengthStep);
    set("replayLength", qMax(length, value("replayLength").toInt()));
    const int offset = value("replayOffset").toInt();
    if (value("playStatus").toInt() == 1)
        return showTitle();
    if (offset >= longestReplay)
        set("playStatus", 1); // nothing more can be kept
    setOffset(offset + 1);
}

void XmTunerModel::showTitle()
{
    const int number = heard() / titleLength; // of titles since long ago
    const QStringList own = value("radioText").toString().split(QStringLiteral(" - "));
    if (number * titleLength == ownTitle) {
        set("artist", own.size() > 1 ? own.first() : value("stationName").toString());
        set("title", own.last());
    } else {
        const Title& title = earlierTitles[(number + m_channel) % titleCount];
        set("artist", QString::fromUtf8(title.artist));
        set("title", QString::fromUtf8(title.title));
    }
}

bool XmTunerModel::assign(const QString& field, const QJsonValue& wanted)
{
    if (field == QLatin1String("playStatus")) {
        setPlaying(wanted.toInt() != 0);
    } else if (field == QLatin1String("replayOffset")) {
        setOffset(wanted.toInt());
        return value("replayOffset") == wanted;
    } else if (field == QLatin1String("replayStatus")) {
        setOffset(wanted.toInt() ? qMax(value("replayOffset").toInt(), titleLength / 2) : 0);
    } else {
        return field != QLatin1String("replayLength") && TunerModel::assign(field, wanted);
    }
    return true;
}

} // namespace HmiVehicle
