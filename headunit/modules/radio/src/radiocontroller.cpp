// SPDX-License-Identifier: MIT
#include "radiocontroller.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/XMTunerSource>

using namespace AL2HMIBridge;

namespace {

struct Band
{
    const char* name;
    GlobalSource::ALAudioSource audioSource;
    TunerSource::CurrentMode mode;
    TunerSource* (*tuner)();
};

template <typename Source>
TunerSource* tunerOf()
{
    return Source::instance();
}

constexpr Band allBands[] = {
    {QT_TRANSLATE_NOOP("RadioController", "FM"), GlobalSource::AudioFM, TunerSource::ModeFM, tunerOf<FMTunerSource>},
    {QT_TRANSLATE_NOOP("RadioController", "AM"), GlobalSource::AudioAM, TunerSource::ModeAM, tunerOf<AMTunerSource>},
    {QT_TRANSLATE_NOOP("RadioController", "DAB"), GlobalSource::AudioDAB, TunerSource::ModeDAB,
     tunerOf<DABTunerSource>},
    {QT_TRANSLATE_NOOP("RadioController", "Satellite"), GlobalSource::AudioXM, TunerSource::ModeXM,
     tunerOf<XMTunerSource>},
};
constexpr int bandCount = int(sizeof allBands / sizeof *allBands);

} // namespace

RadioController::RadioController(QObject* parent)
    : QObject(parent)
{
    connect(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged, this, &RadioController::followAudioSource);
    followAudioSource();
}

QStringList RadioController::bands() const
{
    QStringList names;
    for (const Band& band : allBands)
        names.append(tr(band.name));
    return names;
}

TunerSource* RadioController::tuner() const
{
    return allBands[m_band].tuner();
}

void RadioController::selectBand(int band)
{
    if (band >= 0 && band < bandCount)
        GlobalSource::instance()->setAudioSource(allBands[band].audioSource, -1);
}

void RadioController::seekUp()
{
    GlobalSource::instance()->sendShortSeekUp();
}

void RadioController::seekDown()
{
    GlobalSource::instance()->sendShortSeekDown();
}

void RadioController::recallPreset(int preset)
{
    tuner()->recallPreset(allBands[m_band].mode, preset);
}

void RadioController::storePreset(int preset)
{
    tuner()->storePreset(allBands[m_band].mode, preset);
}

/// While something else plays the screens keep the band heard last.
void RadioController::followAudioSource()
{
    for (int band = 0; band < bandCount; ++band) {
        if (allBands[band].audioSource != GlobalSource::instance()->mainAudioSource() || band == m_band)
            continue;
        m_band = band;
        Q_EMIT bandChanged();
    }
}
