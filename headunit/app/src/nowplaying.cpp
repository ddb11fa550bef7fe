// SPDX-License-Identifier: MIT
#include "nowplaying.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/XMTunerSource>

using namespace AL2HMIBridge;

namespace {

/// The tuner that is the main audio source, or null.
TunerSource* mainTuner()
{
    switch (GlobalSource::instance()->mainAudioSource()) {
    case GlobalSource::AudioAM:
        return AMTunerSource::instance();
    case GlobalSource::AudioFM:
        return FMTunerSource::instance();
    case GlobalSource::AudioXM:
        return XMTunerSource::instance();
    case GlobalSource::AudioDAB:
        return DABTunerSource::instance();
    default:
        return nullptr;
    }
}

QString sourceName()
{
    switch (GlobalSource::instance()->mainAudioSource()) {
    case GlobalSource::AudioAM:
        return QStringLiteral("AM");
    case GlobalSource::AudioFM:
        return QStringLiteral("FM");
    case GlobalSource::AudioXM:
        return NowPlaying::tr("Satellite");
    case GlobalSource::AudioDAB:
        return QStringLiteral("DAB");
    case GlobalSource::AudioCD:
        return NowPlaying::tr("CD");
    case GlobalSource::AudioMedia:
        return NowPlaying::tr("Media");
    default:
        return QString();
    }
}

} // namespace

NowPlaying::NowPlaying(QObject* parent)
    : QObject(parent)
{
    connect(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged, this, &NowPlaying::update);
    for (TunerSource* const tuner :
         {static_cast<TunerSource*>(AMTunerSource::instance()), static_cast<TunerSource*>(FMTunerSource::instance()),
          static_cast<TunerSource*>(XMTunerSource::instance()),
          static_cast<TunerSource*>(DABTunerSource::instance())}) {
        connect(tuner, &TunerSource::frequencyChanged, this, &NowPlaying::update);
        connect(tuner, &TunerSource::stationNameChanged, this, &NowPlaying::update);
        connect(tuner, &TunerSource::radioTextChanged, this, &NowPlaying::update);
    }
    connect(MediaAudioSource::instance(), &MediaAudioSource::titleChanged, this, &NowPlaying::update);
    connect(MediaAudioSource::instance(), &MediaAudioSource::artistChanged, this, &NowPlaying::update);
    connect(CDSource::instance(), &CDSource::titleChanged, this, &NowPlaying::update);
    update();
}

QString NowPlaying::icon() const
{
    return mainTuner() ? QStringLiteral("radio") : QStringLiteral("media");
}

void NowPlaying::next()
{
    if (mainTuner())
        GlobalSource::instance()->sendShortSeekUp();
    else if (GlobalSource::instance()->mainAudioSource() == GlobalSource::AudioCD)
        CDSource::instance()->nextTrack();
    else
        MediaAudioSource::instance()->next();
}

void NowPlaying::previous()
{
    if (mainTuner())
        GlobalSource::instance()->sendShortSeekDown();
    else if (GlobalSource::instance()->mainAudioSource() == GlobalSource::AudioCD)
        CDSource::instance()->previousTrack();
    else
        MediaAudioSource::instance()->previous();
}

void NowPlaying::update()
{
    m_source = sourceName();
    if (const TunerSource* const tuner = mainTuner()) {
        const QString frequency = tuner->frequency() + QLatin1Char(' ') + tuner->frequencyUnit();
        m_title = tuner->stationName().isEmpty() ? frequency : tuner->stationName();
        m_subtitle = tuner->radioText().isEmpty() ? frequency : tuner->radioText();
    } else if (GlobalSource::instance()->mainAudioSource() == GlobalSource::AudioCD) {
        m_title = CDSource::instance()->title();
        m_subtitle = CDSource::instance()->discTitle();
    } else {
        m_title = MediaAudioSource::instance()->title();
        m_subtitle = MediaAudioSource::instance()->artist();
    }
    Q_EMIT changed();
}
