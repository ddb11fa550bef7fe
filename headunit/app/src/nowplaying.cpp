// SPDX-License-Identifier: MIT
#include "nowplaying.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/ProjectionSource>
#include <AL2HMIBridge/XMTunerSource>
#include <HmiCore/HmiManager>

using namespace AL2HMIBridge;
using HmiCore::HmiManager;

namespace {

struct Kind
{
    GlobalSource::ALAudioSource source;
    const char* name;
    const char* icon;
    QString (*title)();
    QString (*subtitle)();
    void (*next)();
    void (*previous)();
    bool (*isPlaying)(); // null for what cannot pause
};

QString frequency(const TunerSource* tuner)
{
    return tuner->frequency() + QLatin1Char(' ') + tuner->frequencyUnit();
}

template <typename Tuner>
QString station()
{
    const TunerSource* const tuner = Tuner::instance();
    return tuner->stationName().isEmpty() ? frequency(tuner) : tuner->stationName();
}

template <typename Tuner>
QString radioText()
{
    const TunerSource* const tuner = Tuner::instance();
    return tuner->radioText().isEmpty() ? frequency(tuner) : tuner->radioText();
}

QString song()
{
    const auto* const tuner = XMTunerSource::instance();
    if (tuner->artist().isEmpty() || tuner->title().isEmpty())
        return tuner->title() + tuner->artist();
    return tuner->artist() + QStringLiteral(" – ") + tuner->title();
}

QString phoneTitle()
{
    const auto* const phone = ProjectionSource::instance();
    return phone->projectedTitle().isEmpty() ? phone->projectedDeviceName() : phone->projectedTitle();
}

QString phoneArtist()
{
    const auto* const phone = ProjectionSource::instance();
    return phone->projectedArtist().isEmpty() ? NowPlaying::tr("Plays on the phone") : phone->projectedArtist();
}

void seekUp()
{
    GlobalSource::instance()->sendShortSeekUp();
}

void seekDown()
{
    GlobalSource::instance()->sendShortSeekDown();
}

/// A projected phone is operated with the numbers of the hard keys.
template <int key>
void pressPhoneKey()
{
    ProjectionSource::instance()->projectionButtonPress(key);
    ProjectionSource::instance()->projectionButtonRelease(key);
}

constexpr Kind projection(GlobalSource::ALAudioSource source)
{
    return {source,           QT_TRANSLATE_NOOP("NowPlaying", "Phone"),
            "projection",     phoneTitle,
            phoneArtist,      pressPhoneKey<7>,
            pressPhoneKey<6>, [] { return ProjectionSource::instance()->projectedPlaying(); }};
}

template <typename Tuner>
constexpr Kind radio(GlobalSource::ALAudioSource source, const char* name)
{
    return {source, name, "radio", station<Tuner>, radioText<Tuner>, seekUp, seekDown, nullptr};
}

const Kind kinds[] = {
    radio<AMTunerSource>(GlobalSource::AudioAM, QT_TRANSLATE_NOOP("NowPlaying", "AM")),
    radio<FMTunerSource>(GlobalSource::AudioFM, QT_TRANSLATE_NOOP("NowPlaying", "FM")),
    radio<DABTunerSource>(GlobalSource::AudioDAB, QT_TRANSLATE_NOOP("NowPlaying", "DAB")),
    {GlobalSource::AudioXM, QT_TRANSLATE_NOOP("NowPlaying", "Satellite"), "satellite", station<XMTunerSource>, song,
     seekUp, seekDown, nullptr},
    {GlobalSource::AudioCD, QT_TRANSLATE_NOOP("NowPlaying", "CD"), "disc",
     [] {
         return CDSource::instance()->title().isEmpty() ? NowPlaying::tr("Track %1").arg(CDSource::instance()->track())
                                                        : CDSource::instance()->title();
     },
     [] { return CDSource::instance()->discTitle(); }, [] { CDSource::instance()->nextTrack(); },
     [] { CDSource::instance()->previousTrack(); },
     [] { return CDSource::instance()->cdStatus() == CDSource::CDPlaying; }},
    {GlobalSource::AudioMedia, QT_TRANSLATE_NOOP("NowPlaying", "Player"), "media",
     [] { return MediaAudioSource::instance()->title(); }, [] { return MediaAudioSource::instance()->artist(); },
     [] { MediaAudioSource::instance()->next(); }, [] { MediaAudioSource::instance()->previous(); },
     [] { return MediaAudioSource::instance()->playing(); }},
    projection(GlobalSource::AudioProjectionWired),
    projection(GlobalSource::AudioProjectionWireless),
};

/// What is the main audio source, or null.
const Kind* heard()
{
    for (const Kind& kind : kinds)
        if (kind.source == GlobalSource::instance()->mainAudioSource())
            return &kind;
    return nullptr;
}

} // namespace

NowPlaying::NowPlaying(QObject* parent)
    : QObject(parent)
{
    connect(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged, this, &NowPlaying::changed);
    for (TunerSource* const tuner :
         {static_cast<TunerSource*>(AMTunerSource::instance()), static_cast<TunerSource*>(FMTunerSource::instance()),
          static_cast<TunerSource*>(XMTunerSource::instance()),
          static_cast<TunerSource*>(DABTunerSource::instance())}) {
        connect(tuner, &TunerSource::frequencyChanged, this, &NowPlaying::changed);
        connect(tuner, &TunerSource::stationNameChanged, this, &NowPlaying::changed);
        connect(tuner, &TunerSource::radioTextChanged, this, &NowPlaying::changed);
    }
    connect(XMTunerSource::instance(), &XMTunerSource::titleChanged, this, &NowPlaying::changed);
    connect(XMTunerSource::instance(), &XMTunerSource::artistChanged, this, &NowPlaying::changed);
    connect(MediaAudioSource::instance(), &MediaAudioSource::titleChanged, this, &NowPlaying::changed);
    connect(MediaAudioSource::instance(), &MediaAudioSource::artistChanged, this, &NowPlaying::changed);
    connect(MediaAudioSource::instance(), &MediaAudioSource::playingChanged, this, &NowPlaying::changed);
    connect(CDSource::instance(), &CDSource::titleChanged, this, &NowPlaying::changed);
    connect(CDSource::instance(), &CDSource::trackChanged, this, &NowPlaying::changed);
    connect(CDSource::instance(), &CDSource::discTitleChanged, this, &NowPlaying::changed);
    connect(CDSource::instance(), &CDSource::cdStatusChanged, this, &NowPlaying::changed);
    auto* const phone = ProjectionSource::instance();
    connect(phone, &ProjectionSource::projectedDeviceNameChanged, this, &NowPlaying::changed);
    connect(phone, &ProjectionSource::projectedPlayingChanged, this, &NowPlaying::changed);
    connect(phone, &ProjectionSource::projectedTitleChanged, this, &NowPlaying::changed);
    connect(phone, &ProjectionSource::projectedArtistChanged, this, &NowPlaying::changed);
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, &NowPlaying::changed);
}

QString NowPlaying::source() const
{
    return heard() ? tr(heard()->name) : QString();
}

QString NowPlaying::icon() const
{
    return heard() ? QString::fromLatin1(heard()->icon) : QStringLiteral("media");
}

QString NowPlaying::title() const
{
    return heard() ? heard()->title() : QString();
}

QString NowPlaying::subtitle() const
{
    return heard() ? heard()->subtitle() : QString();
}

bool NowPlaying::pausable() const
{
    return heard() && heard()->isPlaying;
}

bool NowPlaying::playing() const
{
    return !pausable() || heard()->isPlaying();
}

void NowPlaying::next()
{
    if (heard())
        heard()->next();
}

void NowPlaying::previous()
{
    if (heard())
        heard()->previous();
}
