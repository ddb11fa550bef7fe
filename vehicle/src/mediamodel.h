// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/remotes.h"
#include "audiomodel.h"

namespace HmiVehicle {

/// The media player with a library of invented music, or a real player. It plays while it is the main source.
class MediaModel : public AudioModel
{
public:
    explicit MediaModel(Scheduler& scheduler);

    void activate(int instance) override;
    void deactivate() override;
    void interrupt() override;
    void goOn() override;
    bool assign(const QString& field, const QJsonValue& value) override;
    void seek(Step step) override;
    void startWinding(Step step) override;
    void stopWinding() override;

    /// Null for the library.
    void setRemote(MediaRemote* remote);
    void show(const MediaShown& shown);

private:
    void next();
    void seekTo(int position);
    void setPlaying(bool playing);
    void showTrack(int index);
    void move(int seconds);
    void previous();

    MediaRemote* m_remote = nullptr;
    int m_clock = 0;
    int m_winding = 0;
    bool m_interrupted = false;
};

} // namespace HmiVehicle
