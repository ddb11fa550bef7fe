// SPDX-License-Identifier: MIT
#include "mediacontroller.h"

#include <AL2HMIBridge/CDSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/ProjectionSource>
#include <HmiCore/HmiManager>

using namespace AL2HMIBridge;
using HmiCore::HmiManager;

namespace {

/// Numbers of the hard keys that a projected phone is operated with.
enum PhoneKey { PreviousKey = 6, NextKey = 7, PlayPauseKey = 83 };

void pressPhoneKey(PhoneKey key)
{
    ProjectionSource::instance()->projectionButtonPress(key);
    ProjectionSource::instance()->projectionButtonRelease(key);
}

bool isProjection(GlobalSource::ALAudioSource source)
{
    return source == GlobalSource::AudioProjectionWired || source == GlobalSource::AudioProjectionWireless;
}

bool hasProjection()
{
    return ProjectionSource::instance()->projectionMode() != 0;
}

bool hasDisc()
{
    const auto status = CDSource::instance()->cdStatus();
    return status == CDSource::CDPlaying || status == CDSource::CDPaused;
}

} // namespace

MediaController::MediaController(QObject* parent)
    : QObject(parent)
    , m_library(new LibraryModel(this))
{
    auto* const player = MediaAudioSource::instance();
    auto* const disc = CDSource::instance();
    connect(GlobalSource::instance(), &GlobalSource::mainAudioSourceChanged, this, &MediaController::follow);
    connect(ProjectionSource::instance(), &ProjectionSource::projectionModeChanged, this, &MediaController::follow);
    for (const auto signal : {&ProjectionSource::projectedDeviceNameChanged, &ProjectionSource::projectedPlayingChanged,
                              &ProjectionSource::projectedTitleChanged, &ProjectionSource::projectedArtistChanged})
        connect(ProjectionSource::instance(), signal, this, &MediaController::changed);
    for (const auto signal :
         {&MediaAudioSource::playingChanged, &MediaAudioSource::titleChanged, &MediaAudioSource::artistChanged,
          &MediaAudioSource::albumChanged, &MediaAudioSource::libraryChanged})
        connect(player, signal, this, &MediaController::changed);
    for (const auto signal : {&CDSource::cdStatusChanged, &CDSource::titleChanged, &CDSource::discTitleChanged,
                              &CDSource::trackChanged, &CDSource::trackCountChanged})
        connect(disc, signal, this, &MediaController::changed);
    for (const auto signal : {&MediaAudioSource::positionChanged, &MediaAudioSource::durationChanged})
        connect(player, signal, this, &MediaController::progressed);
    for (const auto signal : {&CDSource::positionChanged, &CDSource::durationChanged})
        connect(disc, signal, this, &MediaController::progressed);
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, &MediaController::changed);
    follow();
}

bool MediaController::isMedia(int audioSource)
{
    return audioSource == GlobalSource::AudioMedia || audioSource == GlobalSource::AudioCD
           || isProjection(GlobalSource::ALAudioSource(audioSource));
}

QStringList MediaController::kinds() const
{
    QStringList names{tr("Player"), tr("CD")};
    if (hasProjection() || m_kind == Projection)
        names.append(tr("Phone"));
    return names;
}

/// While a tuner plays the screens keep what was heard last.
void MediaController::follow()
{
    const auto source = GlobalSource::instance()->mainAudioSource();
    if (isProjection(source))
        m_kind = Projection;
    else if (source == GlobalSource::AudioCD)
        m_kind = Disc;
    else if (source == GlobalSource::AudioMedia || (m_kind == Projection && !hasProjection()))
        m_kind = Player;
    Q_EMIT changed();
    Q_EMIT progressed();
}

bool MediaController::heard() const
{
    const auto source = GlobalSource::instance()->mainAudioSource();
    switch (m_kind) {
    case Disc:
        return source == GlobalSource::AudioCD;
    case Projection:
        return isProjection(source);
    default:
        return source == GlobalSource::AudioMedia;
    }
}

bool MediaController::available() const
{
    switch (m_kind) {
    case Disc:
        return hasDisc();
    case Projection:
        return hasProjection();
    default:
        return !MediaAudioSource::instance()->library().isEmpty() || !MediaAudioSource::instance()->title().isEmpty();
    }
}

bool MediaController::playing() const
{
    switch (m_kind) {
    case Disc:
        return CDSource::instance()->cdStatus() == CDSource::CDPlaying;
    case Projection:
        return ProjectionSource::instance()->projectedPlaying();
    default:
        return MediaAudioSource::instance()->playing();
    }
}

QString MediaController::icon() const
{
    const char* const icons[] = {"media", "disc", "projection"};
    return QString::fromLatin1(icons[m_kind]);
}

QString MediaController::title() const
{
    const auto* const disc = CDSource::instance();
    const auto* const phone = ProjectionSource::instance();
    switch (m_kind) {
    case Disc:
        return disc->title().isEmpty() ? tr("Track %1").arg(disc->track()) : disc->title();
    case Projection:
        return phone->projectedTitle().isEmpty() ? phone->projectedDeviceName() : phone->projectedTitle();
    default:
        return MediaAudioSource::instance()->title();
    }
}

QString MediaController::artist() const
{
    switch (m_kind) {
    case Disc:
        return CDSource::instance()->discTitle();
    case Projection:
        return ProjectionSource::instance()->projectedArtist();
    default:
        return MediaAudioSource::instance()->artist();
    }
}

QString MediaController::album() const
{
    const auto* const disc = CDSource::instance();
    switch (m_kind) {
    case Disc:
        return tr("Track %1 of %2").arg(disc->track()).arg(disc->trackCount());
    case Projection:
        return tr("Plays on the phone");
    default:
        return MediaAudioSource::instance()->album();
    }
}

QString MediaController::notice() const
{
    if (available())
        return QString();
    if (m_kind == Disc)
        return CDSource::instance()->cdStatus() == CDSource::CDLoading ? tr("Reading the disc…") : tr("No disc");
    return m_kind == Projection ? tr("No phone is projected") : tr("No music");
}

int MediaController::position() const
{
    if (m_kind == Projection)
        return 0;
    return m_kind == Disc ? CDSource::instance()->position() : MediaAudioSource::instance()->position();
}

int MediaController::duration() const
{
    if (m_kind == Projection)
        return 0;
    return m_kind == Disc ? CDSource::instance()->duration() : MediaAudioSource::instance()->duration();
}

void MediaController::selectKind(int kind)
{
    if (kind < Player || kind >= kinds().size())
        return;
    m_kind = Kind(kind); // shown at once, so that one sees why a disc that is not there does not play
    Q_EMIT changed();
    Q_EMIT progressed();
    if (available() && !heard())
        togglePlayPause();
}

void MediaController::togglePlayPause()
{
    const bool isWireless = ProjectionSource::instance()->projectionMode() > 1;
    const GlobalSource::ALAudioSource sources[] = {GlobalSource::AudioMedia, GlobalSource::AudioCD,
                                                   isWireless ? GlobalSource::AudioProjectionWireless
                                                              : GlobalSource::AudioProjectionWired};
    if (!heard())
        GlobalSource::instance()->setAudioSource(sources[m_kind], -1);
    else if (m_kind == Disc)
        CDSource::instance()->togglePlayPause(playing() ? CDSource::CDPaused : CDSource::CDPlaying);
    else if (m_kind == Projection)
        pressPhoneKey(PlayPauseKey);
    else
        MediaAudioSource::instance()->togglePlayPause();
}

void MediaController::next()
{
    if (m_kind == Disc)
        CDSource::instance()->nextTrack();
    else if (m_kind == Projection)
        pressPhoneKey(NextKey);
    else
        MediaAudioSource::instance()->next();
}

void MediaController::previous()
{
    if (m_kind == Disc)
        CDSource::instance()->previousTrack();
    else if (m_kind == Projection)
        pressPhoneKey(PreviousKey);
    else
        MediaAudioSource::instance()->previous();
}

void MediaController::seekTo(int seconds)
{
    if (m_kind == Player)
        MediaAudioSource::instance()->seekTo(seconds);
}

void MediaController::playLibraryRow(int row)
{
    MediaAudioSource::instance()->playTrack(row);
    if (GlobalSource::instance()->mainAudioSource() != GlobalSource::AudioMedia)
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioMedia, -1);
}

/// A disc is only ever told to go to the next or the previous track.
void MediaController::playDiscTrack(int track)
{
    CDSource* const disc = CDSource::instance();
    if (track < 1 || track > disc->trackCount())
        return;
    if (GlobalSource::instance()->mainAudioSource() != GlobalSource::AudioCD)
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioCD, -1);
    for (int at = disc->track(); at < track; ++at)
        disc->nextTrack();
    for (int at = disc->track(); at > track; --at)
        disc->previousTrack();
}
