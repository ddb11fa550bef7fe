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

    bool announces() const; ///< an announcement is heard

    bool assign(const QString& field, const QJsonValue& value) override;

    static constexpr int bankCount = 2;
    static constexpr int bankSize = 6;

protected:
    bool tuneTo(const QString& frequency); ///< false when it is not in the band
    /// As tuneTo(), with a sub-channel as the HMI asks for it.
    virtual void tuneToProgram(const QString& frequency, const QString& subChannel);
    virtual void tuned(const Station* station); ///< null for a frequency without a station
    const Band& band() const { return m_band; }

private:
    void initialState();
    void addAnswers();
    int stationIndex() const; ///< of what is tuned, -1 for none
    int nextStation(Step step) const;
    void beginSeek(int stationToFind, Step step, const char* flag);
    void runTowards(const QString& frequency, Step step);
    QString nextFrequency(Step step) const; ///< on the raster, round the ends of the band
    int stepsBetween(const QString& from, const QString& to, Step step) const;
    void stopSeek();
    void selectBank(int bank);
    void recall(int number); ///< over all banks, from 1
    void publishPresets();
    void setTrafficAnnouncements(bool enabled);
    void startAutoStore();
    void cancelAutoStore();
    void storeStrongest();
    void endAnnouncement();

    const Band& m_band;
    std::array<int, bankCount * bankSize> m_presets; ///< rows of the station list, -1 for an empty one
    int m_seek = 0;
    int m_winding = 0;
    int m_autoStore = 0;
    int m_autoStoreProgress = 0;
    int m_announcement = 0;
};

} // namespace HmiVehicle
