// SPDX-License-Identifier: MIT
#include "audiosources.h"

#include "market.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/ProjectionSource>
#include <AL2HMIBridge/XMTunerSource>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiManager>

#include <algorithm>
#include <iterator>
#include <utility>

using namespace AL2HMIBridge;
using HmiCore::HmiIntentManager;
using HmiCore::HmiManager;

namespace {

bool always()
{
    return true;
}

template <typename Tuner>
QString station()
{
    const auto* const tuner = Tuner::instance();
    return tuner->stationName().isEmpty() ? tuner->frequency() + QLatin1Char(' ') + tuner->frequencyUnit()
                                          : tuner->stationName();
}

bool hasDisc()
{
    const auto status = CDSource::instance()->cdStatus();
    return status == CDSource::CDPlaying || status == CDSource::CDPaused;
}

QString disc()
{
    if (CDSource::instance()->cdStatus() == CDSource::CDLoading)
        return AudioSources::tr("Reading the disc…");
    if (!hasDisc())
        return AudioSources::tr("No disc");
    const QString title = CDSource::instance()->discTitle();
    return title.isEmpty() ? AudioSources::tr("%n track(s)", nullptr, CDSource::instance()->trackCount()) : title;
}

QString track()
{
    return MediaAudioSource::instance()->title();
}

/// The vehicle tells the kind of a projection: 1 on the cable, anything else without.
template <bool onCable>
bool isProjected()
{
    const int mode = ProjectionSource::instance()->projectionMode();
    return mode != 0 && (mode == 1) == onCable;
}

QString phone()
{
    return ProjectionSource::instance()->projectedDeviceName();
}

} // namespace

struct AudioSources::Entry
{
    GlobalSource::ALAudioSource source;
    const char* name;
    const char* icon;
    bool (*isPlayable)();
    QString (*hint)();
};

namespace {

const AudioSources::Entry entries[] = {
    {GlobalSource::AudioFM, QT_TRANSLATE_NOOP("AudioSources", "FM"), "radio", always, station<FMTunerSource>},
    {GlobalSource::AudioAM, QT_TRANSLATE_NOOP("AudioSources", "AM"), "radio", always, station<AMTunerSource>},
    {GlobalSource::AudioDAB, QT_TRANSLATE_NOOP("AudioSources", "DAB"), "radio", always, station<DABTunerSource>},
    {GlobalSource::AudioXM, QT_TRANSLATE_NOOP("AudioSources", "Satellite"), "satellite", always,
     station<XMTunerSource>},
    {GlobalSource::AudioMedia, QT_TRANSLATE_NOOP("AudioSources", "Player"), "media", always, track},
    {GlobalSource::AudioCD, QT_TRANSLATE_NOOP("AudioSources", "CD"), "disc", hasDisc, disc},
    {GlobalSource::AudioProjectionWired, QT_TRANSLATE_NOOP("AudioSources", "Phone"), "projection", isProjected<true>,
     phone},
    {GlobalSource::AudioProjectionWireless, QT_TRANSLATE_NOOP("AudioSources", "Phone"), "projection",
     isProjected<false>, phone},
};

} // namespace

/// A disc that is missing is shown as such; a phone that is not projected is not a source at all.
bool AudioSources::isListed(const Entry& entry) const
{
    const bool isProjection =
        entry.source == GlobalSource::AudioProjectionWired || entry.source == GlobalSource::AudioProjectionWireless;
    return isProjection ? entry.isPlayable() : m_market.offersSource(entry.source);
}

const AudioSources::Entry* AudioSources::entryAt(int row) const
{
    for (const Entry& entry : entries)
        if (isListed(entry) && row-- == 0)
            return &entry;
    return nullptr;
}

AudioSources::AudioSources(const Market& market, QObject* parent)
    : QAbstractListModel(parent)
    , m_market(market)
{
    for (TunerSource* const tuner :
         {static_cast<TunerSource*>(AMTunerSource::instance()), static_cast<TunerSource*>(FMTunerSource::instance()),
          static_cast<TunerSource*>(XMTunerSource::instance()),
          static_cast<TunerSource*>(DABTunerSource::instance())}) {
        connect(tuner, &TunerSource::stationNameChanged, this, &AudioSources::update);
        connect(tuner, &TunerSource::frequencyChanged, this, &AudioSources::update);
    }
    connect(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged, this, [this] {
        update();
        showAwaited();
    });
    connect(MediaAudioSource::instance(), &MediaAudioSource::titleChanged, this, &AudioSources::update);
    connect(CDSource::instance(), &CDSource::cdStatusChanged, this, &AudioSources::update);
    connect(CDSource::instance(), &CDSource::discTitleChanged, this, &AudioSources::update);
    connect(CDSource::instance(), &CDSource::trackCountChanged, this, &AudioSources::update);
    const auto reset = [this] {
        beginResetModel();
        endResetModel();
    };
    connect(ProjectionSource::instance(), &ProjectionSource::projectionModeChanged, this, reset);
    connect(&market, &Market::changed, this, reset);
    connect(HmiCore::HmiManager::instance(), &HmiCore::HmiManager::hmiRetranslated, this, &AudioSources::update);
    connect(ProjectionSource::instance(), &ProjectionSource::projectedDeviceNameChanged, this, &AudioSources::update);
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, &AudioSources::update);
}

int AudioSources::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(std::count_if(std::begin(entries), std::end(entries), [this](const Entry& entry) {
        return isListed(entry);
    }));
}

QVariant AudioSources::data(const QModelIndex& index, int role) const
{
    const Entry* const entry = index.isValid() ? entryAt(index.row()) : nullptr;
    if (!entry)
        return {};
    switch (role) {
    case Name:
        return tr(entry->name);
    case Icon:
        return QString::fromLatin1(entry->icon);
    case Hint:
        return entry->hint();
    case Playable:
        return entry->isPlayable();
    case Active:
        return GlobalSource::instance()->mainAudioSource() == entry->source;
    default:
        return {};
    }
}

QHash<int, QByteArray> AudioSources::roleNames() const
{
    return {{Name, "name"}, {Icon, "icon"}, {Hint, "hint"}, {Playable, "playable"}, {Active, "active"}};
}

void AudioSources::select(int row)
{
    const Entry* const entry = entryAt(row);
    if (!entry || !entry->isPlayable())
        return;
    HmiIntentManager::instance()->requestAction(HmiIntentManager::ChangeAudioSource, {int(entry->source), -1}, true);
    m_awaited = entry->source;
    if (GlobalSource::instance()->mainAudioSource() == entry->source)
        showAwaited();
}

/// The screen of a source belongs to whichever module shows what is heard.
void AudioSources::showAwaited()
{
    const int awaited = std::exchange(m_awaited, nothing);
    if (awaited != nothing && awaited == GlobalSource::instance()->mainAudioSource())
        HmiIntentManager::instance()->requestAction(HmiIntentManager::ShowCurrentAudioPrimary);
}

void AudioSources::update()
{
    if (rowCount() > 0)
        Q_EMIT dataChanged(index(0), index(rowCount() - 1));
}
