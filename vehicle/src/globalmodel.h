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

    /// Nobody holds a key or needs the tune knob any more.
    void releaseKeys();
    /// A source that cannot play any more, such as a CD player without its disc, gives way to the one before it.
    void leaveWhatCannotPlay();
    /// A call or an announcement is heard instead of the source, or no longer.
    void setInterrupted(bool interrupted);

    bool assign(const QString& field, const QJsonValue& value) override;

private:
    void addKeyAnswers();
    void addSettingAnswers();
    bool setAudioSource(int source, int instance);
    void setPower(bool on);
    int sourceAfter(int source) const;
    AudioModel* player() const; ///< one that does nothing for a source without a model
    void changeVolume(int by);
    void pressVolume(int by); ///< a volume key: of the voice while it is heard
    void startRamp(int by);
    void stopRamp();
    void showClock();

    const std::map<int, AudioModel*> m_players;
    PhoneModel& m_phone;
    SpeechModel& m_speech;
    const QTime m_startTime;
    int m_ramp = 0;
    int m_previousSource = 1;
    bool m_interrupted = false;
    bool m_tuneKnobReserved = false;
};

} // namespace HmiVehicle
