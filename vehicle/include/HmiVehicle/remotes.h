// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

namespace HmiVehicle {

/// \brief A real player that stands in for the vehicle's own; see Vehicle::setMediaRemote(). Functions do not wait.
class MediaRemote
{
public:
    virtual ~MediaRemote() = default;
    virtual void setPlaying(bool playing) = 0;
    virtual void next() = 0;
    virtual void previous() = 0;
    /// \brief Goes to \a position, in seconds.
    virtual void seekTo(int position) = 0;
};

/// \brief What a real player plays.
struct MediaShown
{
    bool playing = false;
    QString title;
    QString artist;
    QString album;
    int position = 0; ///< seconds
    int duration = 0; ///< seconds
};

/// \brief A real phone that stands in for the vehicle's own; see Vehicle::setPhoneRemote(). Functions do not wait.
class PhoneRemote
{
public:
    virtual ~PhoneRemote() = default;
    virtual void dial(const QString& number) = 0;
    virtual void answer() = 0;
    virtual void hangUp() = 0;
};

/// \brief The call of a real phone.
struct CallShown
{
    enum State { None, Incoming, Dialling, Connected };

    State state = None;
    QString number;
    QString name; ///< empty when the phone does not know it
};

} // namespace HmiVehicle
