// SPDX-License-Identifier: MIT
#include "radiocontroller.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/XMTunerSource>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiManager>

#include <algorithm>
#include <iterator>

using namespace AL2HMIBridge;
using HmiCore::HmiIntentManager;
using HmiCore::HmiManager;

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
constexpr int banksOfATuner = 2;

/// In the order in which the front panel's key looks for one.
const Band* announcingBand()
{
    for (const Band& band : allBands)
        if (band.mode != TunerSource::ModeXM && band.tuner()->announcementType() != 0)
            return &band;
    return nullptr;
}

} // namespace

RadioController::RadioController(QObject* parent)
    : QObject(parent)
{
    connect(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged, this, &RadioController::followAudioSource);
    for (const Band& band : allBands) {
        connect(band.tuner(), &TunerSource::announcementTypeChanged, this, &RadioController::announcementChanged);
        connect(band.tuner(), &TunerSource::announcementTextChanged, this, &RadioController::announcementChanged);
    }
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, &RadioController::retranslated);
    connect(this, &RadioController::retranslated, this, &RadioController::announcementChanged);
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

bool RadioController::isFm() const
{
    return allBands[m_band].mode == TunerSource::ModeFM;
}

bool RadioController::isSatellite() const
{
    return allBands[m_band].mode == TunerSource::ModeXM;
}

bool RadioController::hasAnnouncements() const
{
    return !isSatellite();
}

int RadioController::bankCount() const
{
    return banksOfATuner;
}

bool RadioController::heard() const
{
    return std::any_of(std::begin(allBands), std::end(allBands), [](const Band& band) {
        return band.audioSource == GlobalSource::instance()->mainAudioSource();
    });
}

TunerSource* RadioController::announcing() const
{
    const Band* const band = announcingBand();
    return band ? band->tuner() : nullptr;
}

QString RadioController::announcer() const
{
    const Band* const band = announcingBand();
    return band ? tr(band->name) + QStringLiteral(" · ") + band->tuner()->stationName() : QString();
}

QString RadioController::announcement() const
{
    return announcing() ? announcing()->announcementText() : QString();
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

void RadioController::selectNextBank()
{
    tuner()->selectPresetBank((tuner()->activePresetBank() + 1) % banksOfATuner);
}

void RadioController::toggleTrafficAnnouncements()
{
    if (hasAnnouncements())
        tuner()->toggleTpSeekInProgress(allBands[m_band].mode, !tuner()->trafficAnnouncementEnabled());
}

void RadioController::cancelAnnouncement()
{
    TunerSource* const tuner = announcing();
    if (!tuner)
        return;
    tuner->cancelAnnouncement(tuner->announcementType());
    HmiIntentManager::instance()->requestAction(HmiIntentManager::CancelAnnouncement);
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
