// SPDX-License-Identifier: MIT
#pragma once

#include "audiomodel.h"

namespace HmiVehicle {

/// The CD player; a disc is in it.
class CdModel : public AudioModel
{
public:
    explicit CdModel(Scheduler& scheduler);

    bool canPlay(int source) const override;
    void activate(int instance) override;
    void deactivate() override;
    void interrupt() override;
    void goOn() override;
    void seek(Step step) override;
    void startWinding(Step step) override;
    void stopWinding() override;
    bool assign(const QString& field, const QJsonValue& value) override;

    void eject();
    void insert();

private:
    bool hasDisc() const;
    void setStatus(int status);
    void move(int seconds);
    void showTrack(int track);

    int m_clock = 0;
    int m_loading = 0;
    int m_winding = 0;
    bool m_interrupted = false;
};

} // namespace HmiVehicle
