// SPDX-License-Identifier: MIT
#pragma once

#include "audiomodel.h"

namespace HmiVehicle {

/// The media player with a library of invented music. It plays while it is the main source.
class MediaModel : public AudioModel
{
public:
    explicit MediaModel(Scheduler& scheduler);

    void activate(int instance) override;
    void deactivate() override;
    void seek(Step step) override;
    void startWinding(Step step) override;
    void stopWinding() override;

private:
    void setPlaying(bool playing);
    void showTrack(int index);
    void move(int seconds);
    void previous();

    int m_clock = 0;
    int m_winding = 0;
};

} // namespace HmiVehicle
