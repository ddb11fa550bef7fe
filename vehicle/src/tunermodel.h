// SPDX-License-Identifier: MIT
#pragma once

#include "audiomodel.h"
#include "stations.h"

#include <array>

namespace HmiVehicle {

/// What all tuners do: stations, presets in banks of six, seeking, announcements.
class TunerModel : public AudioModel
{
public:
    TunerModel(const Band& band, Scheduler& scheduler);

    void activate(int instance) override;
    void seek(Step step) override;
    void startWinding(Step step) override;
    void stopWinding() override;
    void tuneStep(Step step) override;
    void recallPresetKey(int preset) override;
    void storePresetKey(int preset) override;

    /// A traffic announcement comes; it ends by itself after a while. Nothing happens while they are switched off.
    void startAnnouncement(const QString& text);

    static constexpr int bankCount = 2;
    static constexpr int bankSize = 6;

protected:
    void tuneTo(const QString& frequency);
    virtual void tuned(const Station* station); ///< null for a frequency without a station
    const Band& band() const { return m_band; }

private:
    void initialState();
    void addAnswers();
    int stationIndex() const; ///< of what is tuned, -1 for none
    int nextStation(Step step) const;
    void beginSeek(int stationToFind, const char* flag);
    void stopSeek();
    void selectBank(int bank);
    void recall(int number); ///< over all banks, from 1
    void publishPresets();
    void setTrafficAnnouncements(bool enabled);
    void autoStore();
    void endAnnouncement();

    const Band& m_band;
    std::array<int, bankCount * bankSize> m_presets; ///< rows of the station list, -1 for an empty one
    int m_seek = 0;
    int m_winding = 0;
    int m_autoStore = 0;
    int m_announcement = 0;
};

} // namespace HmiVehicle
