// SPDX-License-Identifier: MIT
#pragma once

#include "audiomodel.h"

namespace HmiVehicle {

/// The CD player; a disc is in it.
class CdModel : public AudioModel
{
public:
    explicit CdModel(Scheduler& scheduler);

    bool canPlay() const override;
    void activate(int instance) override;
    void deactivate() override;
    void seek(Step step) override;

    void eject();
    void insert();

private:
    void setStatus(int status);
    void showTrack(int track);
    void playOn();

    int m_clock = 0;
    int m_loading = 0;
};

} // namespace HmiVehicle
