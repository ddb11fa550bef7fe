// SPDX-License-Identifier: MIT
#pragma once

#include "tunermodel.h"

namespace HmiVehicle {

/// A digital signal is found a moment after tuning, heard instead of the analogue one, and lost again where it is weak.
class FmTunerModel : public TunerModel
{
public:
    explicit FmTunerModel(Scheduler& scheduler);

    bool assign(const QString& field, const QJsonValue& value) override;

    /// The digital signal fades, or is back. Nothing happens without one.
    void loseDigital();
    void acquireDigital();

protected:
    void tuneToProgram(const QString& frequency, const QString& subChannel) override;
    void tuned(const Station* station) override;

private:
    void lookForDigital(int program);

    int m_wantedProgram = 1; ///< of the station that is tuned next; 0 for the analogue one
    int m_digital = 0;       ///< when the signal comes or goes
    bool m_isWeak = false;
};

class DabTunerModel : public TunerModel
{
public:
    explicit DabTunerModel(Scheduler& scheduler);

protected:
    void tuned(const Station* station) override;
};

/// The satellite tuner. What it played in the last half hour can be replayed.
class XmTunerModel : public TunerModel
{
public:
    explicit XmTunerModel(Scheduler& scheduler);

    void stopWinding() override;
    bool assign(const QString& field, const QJsonValue& value) override;

protected:
    void tuned(const Station* station) override;

private:
    void addReplayAnswers();
    void wind(Step step, bool start);
    void stepTitle(Step step);
    void setOffset(int seconds); ///< behind what is on the air
    void setPlaying(bool playing);
    void passSecond();
    void showTitle();
    int onAir() const; ///< seconds of programme since long ago
    int heard() const { return onAir() - value("replayOffset").toInt(); }

    int m_channel = 0; ///< row of the station list
    int m_tuned = 0;   ///< when, as onAir()
    int m_wind = 0;
};

} // namespace HmiVehicle
