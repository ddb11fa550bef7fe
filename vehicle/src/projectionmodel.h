// SPDX-License-Identifier: MIT
#pragma once

#include "audiomodel.h"

namespace HmiVehicle {

/// A projected phone: it has its own music and calls, and does something with the keys that reach it.
class ProjectionModel : public AudioModel
{
public:
    enum Mode { None = 0, Wired = 1, Wireless = 2 };
    enum Call { NoCall = 0, Ringing = 1, Talking = 2 };

    explicit ProjectionModel(Scheduler& scheduler);

    bool canPlay(int source) const override;
    void activate(int instance) override;
    void deactivate() override;
    void interrupt() override;
    void goOn() override;
    bool assign(const QString& field, const QJsonValue& value) override;

    /// 0 ends the session; other kinds than these count as wired.
    void setMode(int mode);
    /// A call for the projected phone; nothing happens without a session.
    void ring();

private:
    void released(int keyId);
    void showTitle(int index);
    void setPlaying(bool playing);
    void takeCall();
    void endCall();
    void playPause();
    void next();
    void previous();

    int m_title = 0;
    bool m_isHeld = false; ///< the key that goes up was held, so it does nothing more
    bool m_interrupted = false;
};

} // namespace HmiVehicle
