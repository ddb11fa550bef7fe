// SPDX-License-Identifier: MIT
#pragma once

#include "audiomodel.h"

#include <QTime>

#include <map>

namespace HmiVehicle {

class PhoneModel;
class SpeechModel;

/// The vehicle as a whole: which source plays, volume, languages, and the keys that the HMI passes on.
class GlobalModel : public Model
{
public:
    /// \a players by the number of their audio source; everything given outlives this.
    GlobalModel(Scheduler& scheduler, QTime startTime, std::map<int, AudioModel*> players, PhoneModel& phone,
                SpeechModel& speech);

    /// Nobody holds a key any more.
    void releaseKeys();

private:
    void addKeyAnswers();
    void addSettingAnswers();
    void setAudioSource(int source, int instance);
    int sourceAfter(int source) const;
    AudioModel* player() const;
    void changeVolume(int by);
    void startRamp(int by);
    void stopRamp();
    void showClock();

    const std::map<int, AudioModel*> m_players;
    PhoneModel& m_phone;
    SpeechModel& m_speech;
    const QTime m_startTime;
    int m_ramp = 0;
};

} // namespace HmiVehicle
