// SPDX-License-Identifier: MIT
#include "tunermodel.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace HmiVehicle {

namespace {

constexpr int seekTime = 400;
constexpr int windingStep = 80;
constexpr int autoStoreTime = 3000;
constexpr int announcementTime = 20000;

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

TunerModel::TunerModel(const Band& band, Scheduler& scheduler)
    : AudioModel(band.source, scheduler)
    , m_band(band)
{
    for (int i = 0; i < int(m_presets.size()); ++i)
        m_presets[size_t(i)] = i < int(band.stations.size()) ? i : -1;
    initialState();
    addAnswers();
}

void TunerModel::initialState()
{
    set("autoStoreInProgress", false);
    set("autoStoreProgress", 0);
    set("announcementType", 0);
    set("announcementText", QString());
    set("trafficAnnouncementEnabled", false);
    set("activePresetBank", 0);
    set("seeking", false);
    set("tpSeekInProgress", false);
    set("frequencyUnit", text(m_band.unit));
    set("bandMinimum", m_band.minimum);
    set("bandMaximum", m_band.maximum);
    QJsonArray list;
    for (const Station& station : m_band.stations)
        list.append(QJsonObject{{QStringLiteral("frequency"), text(station.frequency)},
                                {QStringLiteral("name"), text(station.name)}});
    set("stationList", list);
    publishPresets();
    recall(1);
}

void TunerModel::addAnswers()
{
    on("tune",
       [this](const QJsonArray& arguments) { tuneToProgram(arguments.at(0).toString(), arguments.at(1).toString()); });
    on("sendAutoStoreCancel", [this] { cancelAutoStore(); });
    on("cancelAnnouncement", [this] { endAnnouncement(); });
    on("toggleTpSeekInProgress",
       [this](const QJsonArray& arguments) { setTrafficAnnouncements(arguments.at(1).toBool()); });
    on("recallPreset", [this](const QJsonArray& arguments) { recallPresetKey(arguments.at(1).toInt()); });
    on("storePreset", [this](const QJsonArray& arguments) { storePresetKey(arguments.at(1).toInt()); });
    on("selectPresetBank", [this](const QJsonArray& arguments) { selectBank(arguments.at(0).toInt()); });
    on("tuneToStation", [this](const QJsonArray& arguments) {
        const int row = arguments.at(0).toInt();
        if (row >= 0 && row < int(m_band.stations.size()))
            tuneTo(text(m_band.stations[size_t(row)].frequency));
    });
    on("startAutoStore", [this] { startAutoStore(); });
}

/// A frequency off the raster or outside the band, or an unknown channel, leaves everything as it is.
bool TunerModel::tuneTo(const QString& frequency)
{
    stopSeek();
    const auto found = std::find_if(m_band.stations.begin(), m_band.stations.end(),
                                    [&](const Station& station) { return text(station.frequency) == frequency; });
    const Station* const station = found == m_band.stations.end() ? nullptr : &*found;
    bool isNumber = false;
    const double number = frequency.toDouble(&isNumber);
    const bool isInBand =
        isNumber && m_band.step > 0 && number >= m_band.minimum && number <= m_band.maximum; // not for NaN
    if (!station && !isInBand)
        return false;
    set("frequency", station ? frequency : QString::number(number, 'f', m_band.decimals));
    const int row = station ? int(found - m_band.stations.begin()) : -1;
    const auto preset = station ? std::find(m_presets.begin(), m_presets.end(), row) : m_presets.end();
    set("activePreset", preset == m_presets.end() ? 0 : int(preset - m_presets.begin()) + 1);
    tuned(station);
    return true;
}

void TunerModel::tuneToProgram(const QString& frequency, const QString&)
{
    tuneTo(frequency);
}

void TunerModel::tuned(const Station* station)
{
    set("stationName", station ? text(station->name) : QString());
    set("radioText", station ? text(station->text) : QString());
    set("signalStrength", station ? station->signal : 5);
}

int TunerModel::stationIndex() const
{
    for (size_t i = 0; i < m_band.stations.size(); ++i)
        if (text(m_band.stations[i].frequency) == value("frequency").toString())
            return int(i);
    return -1;
}

/// The station above or below what is tuned, round the ends of the band.
int TunerModel::nextStation(Step step) const
{
    const int count = qMax(1, int(m_band.stations.size()));
    const int current = stationIndex();
    if (current >= 0)
        return (current + int(step) + count) % count;
    const double frequency = value("frequency").toString().toDouble();
    int above = 0;
    while (above < count && text(m_band.stations[size_t(above)].frequency).toDouble() < frequency)
        ++above;
    return (step == Step::Up ? above : above - 1 + count) % count;
}

void TunerModel::beginSeek(int stationToFind, Step step, const char* flag)
{
    stopSeek();
    set(flag, true);
    const QString frequency = text(m_band.stations[size_t(stationToFind)].frequency);
    const int steps = stepsBetween(value("frequency").toString(), frequency, step);
    if (steps < 2) {
        m_seek = scheduler().answerAfter(seekTime, [this, frequency] { tuneTo(frequency); });
    } else {
        m_seek = scheduler().every(qMax(1, seekTime / steps), [this, frequency, step] { runTowards(frequency, step); });
        if (!m_seek) // time stands still
            tuneTo(frequency);
    }
}

void TunerModel::runTowards(const QString& frequency, Step step)
{
    const QString next = nextFrequency(step);
    if (next == frequency) {
        tuneTo(frequency);
        return;
    }
    set("frequency", next);
    set("stationName", QString());
    set("radioText", QString());
}

int TunerModel::stepsBetween(const QString& from, const QString& to, Step step) const
{
    if (m_band.step <= 0)
        return 0;
    const int count = int(std::lround((m_band.maximum - m_band.minimum) / m_band.step)) + 1;
    const int distance = int(std::lround((to.toDouble() - from.toDouble()) / m_band.step)) * int(step);
    return (distance % count + count) % count;
}

void TunerModel::stopSeek()
{
    scheduler().cancel(&m_seek);
    set("seeking", false);
    set("tpSeekInProgress", false);
}

void TunerModel::seek(Step step)
{
    beginSeek(nextStation(step), step, "seeking");
}

void TunerModel::startWinding(Step step)
{
    stopWinding();
    m_winding = scheduler().every(windingStep, [this, step] { tuneStep(step); });
}

void TunerModel::stopWinding()
{
    scheduler().cancel(&m_winding);
}

void TunerModel::tuneStep(Step step)
{
    tuneTo(nextFrequency(step));
}

QString TunerModel::nextFrequency(Step step) const
{
    if (m_band.step <= 0)
        return text(m_band.stations[size_t(nextStation(step))].frequency);
    const int steps = int(std::lround((m_band.maximum - m_band.minimum) / m_band.step)) + 1;
    const int current = int(std::lround((value("frequency").toString().toDouble() - m_band.minimum) / m_band.step));
    const int next = (current + int(step) + steps) % steps;
    return QString::number(m_band.minimum + next * m_band.step, 'f', m_band.decimals);
}

void TunerModel::activate(int instance)
{
    if (instance >= 0)
        selectBank(instance);
}

void TunerModel::selectBank(int bank)
{
    if (bank >= 0 && bank < bankCount)
        set("activePresetBank", bank);
}

void TunerModel::recallPresetKey(int preset)
{
    if (preset >= 1 && preset <= bankSize)
        recall(value("activePresetBank").toInt() * bankSize + preset);
}

void TunerModel::recall(int number)
{
    const int row = m_presets[size_t(number - 1)];
    if (row < 0)
        return;
    tuneTo(text(m_band.stations[size_t(row)].frequency));
    set("activePreset", number);
}

/// Only stations can be stored; a frequency without one has nothing to come back to.
void TunerModel::storePresetKey(int preset)
{
    if (preset < 1 || preset > bankSize || stationIndex() < 0)
        return;
    const int number = value("activePresetBank").toInt() * bankSize + preset;
    m_presets[size_t(number - 1)] = stationIndex();
    publishPresets();
    set("activePreset", number);
}

void TunerModel::publishPresets()
{
    QJsonArray list;
    for (int i = 0; i < int(m_presets.size()); ++i) {
        if (m_presets[size_t(i)] < 0)
            continue;
        const Station& station = m_band.stations[size_t(m_presets[size_t(i)])];
        list.append(QJsonObject{{QStringLiteral("bank"), i / bankSize},
                                {QStringLiteral("index"), i % bankSize + 1},
                                {QStringLiteral("name"), text(station.name)},
                                {QStringLiteral("frequency"), text(station.frequency)}});
    }
    set("presets", list);
}

/// Switching them on looks for a station that has them, unless the present one does.
void TunerModel::setTrafficAnnouncements(bool enabled)
{
    set("trafficAnnouncementEnabled", enabled);
    stopSeek();
    if (!enabled)
        return endAnnouncement();
    const int current = stationIndex();
    const int count = int(m_band.stations.size());
    const int start = current < 0 ? 0 : current;
    for (int i = 0; i < count; ++i) {
        const int row = (start + i) % count;
        if (!m_band.stations[size_t(row)].traffic)
            continue;
        if (row != current)
            beginSeek(row, Step::Up, "tpSeekInProgress");
        return;
    }
}

void TunerModel::startAutoStore()
{
    cancelAutoStore();
    stopSeek();
    set("autoStoreInProgress", true);
    m_autoStoreProgress = scheduler().every(
        autoStoreTime / 20, [this] { set("autoStoreProgress", qMin(95, value("autoStoreProgress").toInt() + 5)); });
    m_autoStore = scheduler().answerAfter(autoStoreTime, [this] { storeStrongest(); });
}

/// Only a whole run changes presets.
void TunerModel::cancelAutoStore()
{
    scheduler().cancel(&m_autoStore);
    scheduler().cancel(&m_autoStoreProgress);
    set("autoStoreInProgress", false);
    set("autoStoreProgress", 0);
}

void TunerModel::storeStrongest()
{
    std::vector<int> rows(m_band.stations.size());
    std::iota(rows.begin(), rows.end(), 0);
    std::stable_sort(rows.begin(), rows.end(), [this](int left, int right) {
        return m_band.stations[size_t(left)].signal > m_band.stations[size_t(right)].signal;
    });
    const int first = value("activePresetBank").toInt() * bankSize;
    for (int i = 0; i < bankSize; ++i) {
        const size_t place = size_t(first) + size_t(i);
        m_presets[place] = i < int(rows.size()) ? rows[size_t(i)] : -1;
    }
    publishPresets();
    cancelAutoStore();
    recall(first + 1);
}

void TunerModel::startAnnouncement(const QString& announcement)
{
    if (!value("trafficAnnouncementEnabled").toBool())
        return;
    set("announcementType", 1);
    set("announcementText", announcement);
    scheduler().cancel(&m_announcement);
    m_announcement = scheduler().every(announcementTime, [this] { endAnnouncement(); });
}

bool TunerModel::announces() const
{
    return value("announcementType").toInt() != 0;
}

bool TunerModel::assign(const QString& field, const QJsonValue& wanted)
{
    if (field == QLatin1String("frequency"))
        return tuneTo(wanted.toString());
    if (field == QLatin1String("activePresetBank")) {
        selectBank(wanted.toInt());
        return value("activePresetBank") == wanted;
    }
    if (field == QLatin1String("trafficAnnouncementEnabled"))
        setTrafficAnnouncements(wanted.toBool());
    else if (field == QLatin1String("autoStoreInProgress"))
        wanted.toBool() ? startAutoStore() : cancelAutoStore();
    else
        return AudioModel::assign(field, wanted);
    return true;
}

void TunerModel::endAnnouncement()
{
    scheduler().cancel(&m_announcement);
    set("announcementType", 0);
    set("announcementText", QString());
}

} // namespace HmiVehicle
